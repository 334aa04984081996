#pragma once

#include "support/TestPartContainer.h"
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>
#include <VizBridge/services/VizModelerServices.h>

#include <map>
#include <stdexcept>
#include <thread>
#include <vector>

namespace VizBridgeTarvex {

/// A modeler whose ImportPart does, per reference id, what the test scripts; every call is
/// recorded with its thread.
class ScriptedModeler : public VizModelerServices {
public:
    enum class Answer {
        Succeed,
        FalseNoError,
        FalseWithError,
        TrueWithoutContainer,
        ThrowStd,
        ThrowOther
    };

    struct Call {
        int id;
        std::thread::id thread;
    };

    void script(int id, Answer answer) { m_script[id] = answer; }
    std::vector<Call> const& calls() const { return m_calls; }
    std::vector<int> importedIds() const {
        std::vector<int> ids;
        for (Call const& call : m_calls)
            ids.push_back(call.id);
        return ids;
    }

    WString GetName() override { return u"Scripted"; }
    bool ConvertToEntity(unsigned long const&, VizPartContainer*, EntityId&) override {
        return false;
    }
    bool Reserved4() override { return false; }
    KolbaVizCore::ARenderer* CreateRenderer(VizPartContainer*, KolbaVizCore::SceneBuilder*,
                                            RenderId*) override {
        return nullptr;
    }
    VizModelerServices* Clone() override { return new ScriptedModeler(*this); }
    VizBox ExplodeBox(VizTransf const&, VizBox const& box, double const&, double const&,
                      double const&) override {
        return box;
    }
    bool GetAnnotationEntityId(VizPartContainer*, TarvexPMIAnnotation&, int*, EntityId&) override {
        return false;
    }
    bool GetEntityId(VizPartContainer*, TarvexEntity&, EntityId&) override { return false; }
    bool ImportPart(int const& id, TarvexPartDocument& document, TarvexPartImportResult& result,
                    VizPartContainer*& container, TarvexPolicy*, WString& error) override {
        m_calls.push_back({id, std::this_thread::get_id()});
        auto const scripted = m_script.find(id);
        switch (scripted == m_script.end() ? Answer::Succeed : scripted->second) {
        case Answer::Succeed:
            result.SetPMIData(document.GetPMIData());
            container = new TestPartContainer(u"part", id); // passes to the caller
            return true;
        case Answer::FalseNoError:
            return false;
        case Answer::FalseWithError:
            error = u"bad face";
            return false;
        case Answer::TrueWithoutContainer:
            error = u"nothing made";
            return true;
        case Answer::ThrowStd:
            throw std::runtime_error("modeler broke");
        case Answer::ThrowOther:
            throw 42;
        }
        return false;
    }
    bool Reserved11() override { return false; }
    bool Reserved12() override { return false; }
    bool Reserved13() override { return false; }

private:
    std::map<int, Answer> m_script;
    std::vector<Call> m_calls;
};

} // namespace VizBridgeTarvex
