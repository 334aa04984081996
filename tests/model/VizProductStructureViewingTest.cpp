// Activation of views and captures, which decides what PMI shows.
#include "support/VizProductStructureTestPeer.h"

#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizView.h>

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

using namespace VizBridgeTarvex;
using KolbaVizCore::VizCapture;
using KolbaVizCore::VizPMI;
using KolbaVizCore::VizPMICollection;
using KolbaVizCore::VizPMIType;
using KolbaVizCore::VizView;

namespace {

/// Reference 1 holds the PMI a and b, the view V (a) and the captures C (a) and D (b);
/// reference 2 holds the PMI c and the capture E, whose member is a of reference 1.
struct Activation {
    Activation() : structure(VizProductStructureTestPeer::make(u"PMI")) {
        auto first = std::make_unique<VizPMIContainer>(1);
        a = add(*first, u"a");
        b = add(*first, u"b");
        view = collection<VizView>(*first, u"V", u"a");
        c = collection<VizCapture>(*first, u"C", u"a");
        d = collection<VizCapture>(*first, u"D", u"b");
        auto second = std::make_unique<VizPMIContainer>(2);
        pmiC = add(*second, u"c");
        e = collection<VizCapture>(*second, u"E", u"a");
        VizProductStructureTestPeer::addPMIContainer(*structure, 1, first.release());
        VizProductStructureTestPeer::addPMIContainer(*structure, 2, second.release());
    }

    static VizPMI* add(VizPMIContainer& container, char16_t const* id) {
        VizPMIType const note(VizPMIType::FirstNote, "Note", KolbaVizCore::Note);
        auto* const pmi = new VizPMI(note, note); // the container takes it over
        pmi->SetMechanicalID(id);
        container.AddVizPMI(pmi);
        return pmi;
    }

    template <typename Collection>
    static Collection* collection(VizPMIContainer& container, char16_t const* name,
                                  char16_t const* member) {
        auto* const made = new Collection; // the container takes it over
        made->SetName(name);
        made->AddMember(member);
        if constexpr (std::is_same_v<Collection, VizView>)
            container.AddView(made);
        else
            container.AddCapture(made);
        return made;
    }

    /// "shown: <PMI> active: <collections>".
    std::string State() const {
        std::string text = "shown:";
        for (auto const& [name, pmi] : {std::pair{"a", a}, {"b", b}, {"c", pmiC}})
            if (!pmi->GetHidden())
                text += std::string(" ") + name;
        text += " active:";
        for (VizPMICollection const* collection :
             {static_cast<VizPMICollection*>(view), static_cast<VizPMICollection*>(c),
              static_cast<VizPMICollection*>(d), static_cast<VizPMICollection*>(e)})
            if (collection->GetActive())
                text += " " + VizPort::Narrow(collection->GetName());
        return text;
    }

    std::unique_ptr<VizProductStructure> structure;
    VizPMI *a, *b, *pmiC;
    VizView* view;
    VizCapture *c, *d, *e;
};

struct ActivationCase {
    char const* name;
    std::function<void(Activation&)> before; ///< sets states without the structure
    std::function<bool(Activation&)> call;
    char const* state;
};

} // namespace

TEST(VizProductStructureViewing, ActivationSwitchesTheOthersOffAndShowsTheMembersOfTheActiveOne) {
    auto const none = [](Activation&) {};
    ActivationCase const cases[] = {
        {"a capture on: only its members in its own container show", none,
         [](Activation& s) { return s.structure->SetActive(*s.c, true); }, "shown: a active: C"},
        {"the other capture goes off", [](Activation& s) { s.d->SetActive(true); },
         [](Activation& s) { return s.structure->SetActive(*s.c, true); }, "shown: a active: C"},
        {"a member of another container's capture stays hidden", none,
         [](Activation& s) { return s.structure->SetActive(*s.e, true); }, "shown: active: E"},
        {"a capture off while a view was on: every collection off, every PMI hidden",
         [](Activation& s) { s.view->SetActive(true); },
         [](Activation& s) { return s.structure->SetActive(*s.c, false); }, "shown: active:"},
        {"the only active view off: nothing was active, every PMI shows",
         [](Activation& s) { s.view->SetActive(true); },
         [](Activation& s) { return s.structure->SetActive(*s.view, false); },
         "shown: a b c active:"},
        {"a view on: the captures go off and the view's members show",
         [](Activation& s) { s.d->SetActive(true); },
         [](Activation& s) { return s.structure->SetActive(*s.view, true); }, "shown: a active: V"},
        {"a capture in no container: it is set, and with nothing active every PMI shows", none,
         [](Activation& s) {
             VizCapture loose;
             bool const result = s.structure->SetActive(loose, true);
             return result && loose.GetActive();
         },
         "shown: a b c active:"},
    };
    for (ActivationCase const& c : cases) {
        SCOPED_TRACE(c.name);
        Activation stage;
        c.before(stage);
        EXPECT_TRUE(c.call(stage));
        EXPECT_EQ(stage.State(), c.state);
    }
}
