#include <VizBridge/contracts/kolba/AVizCaptureLoader.h>
#include <VizBridge/contracts/kolba/AVizEdgeLoader.h>
#include <VizBridge/contracts/kolba/AVizFaceLoader.h>
#include <VizBridge/contracts/kolba/AVizMeshLoader.h>
#include <VizBridge/contracts/kolba/AVizPMILoader.h>
#include <VizBridge/contracts/kolba/AVizPointSetLoader.h>
#include <VizBridge/contracts/kolba/AVizPointsLoader.h>
#include <VizBridge/contracts/kolba/AVizPolygonLoader.h>
#include <VizBridge/contracts/kolba/AVizTextLoader.h>
#include <VizBridge/contracts/kolba/AVizViewLoader.h>
#include <VizBridge/contracts/kolba/AVizWireLoader.h>

#include "CountedElement.h"

#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>
#include <string>

using namespace KolbaVizCore;
using CountedElement::Counted;
using CountedElement::newCounted;

namespace {

// The least an application's loader does: fill what makeOne gave and return it.
template <class Base> class PassingLoader : public Base {
protected:
    VizElement* loadOne() override {
        VizElement* const made = this->makeOne();
        made->SetVisualID(u"filled");
        return made;
    }
};

template <class Base> std::unique_ptr<VizElement> loadWith() {
    PassingLoader<Base> loader;
    return std::unique_ptr<VizElement>(loader.Load());
}

enum class Outcome { ReturnIt, ReturnNull, WrongClass, ReturnAnother, MakeTwice, Throw };

// An edge loader whose elements count their destruction, and whose loadOne ends as told.
class ScriptedEdgeLoader : public AVizEdgeLoader {
public:
    ScriptedEdgeLoader(Outcome outcome, int& freed) : m_outcome(outcome), m_freed(freed) {}
    VizElement* lastMade = nullptr;
    int makes = 0;

protected:
    VizElement* makeOne() override {
        ++makes;
        if (m_outcome == Outcome::WrongClass)
            return lastMade = keep(std::make_unique<Counted<VizWire>>(m_freed));
        return lastMade = keep(std::make_unique<Counted<VizEdge>>(m_freed));
    }
    VizElement* loadOne() override {
        auto* const edge = dynamic_cast<VizEdge*>(makeOne());
        switch (m_outcome) {
        case Outcome::ReturnNull:
            return nullptr;
        case Outcome::ReturnAnother:
            return newCounted<VizEdge>(m_freed);
        case Outcome::MakeTwice:
            return makeOne();
        case Outcome::Throw:
            throw std::runtime_error("source unreadable");
        default:
            return edge;
        }
    }

private:
    Outcome const m_outcome;
    int& m_freed;
};

// Loads two edges through child loaders, as a wire loader does, then keeps or drops the wire.
class TwoEdgeWireLoader : public AVizWireLoader {
public:
    TwoEdgeWireLoader(bool keepWire, Outcome secondEdge, int& freedEdges)
        : m_keepWire(keepWire), m_secondEdge(secondEdge), m_freedEdges(freedEdges) {}

protected:
    VizElement* loadOne() override {
        auto* const wire = dynamic_cast<VizWire*>(makeOne());
        for (Outcome const outcome : {Outcome::ReturnIt, m_secondEdge}) {
            ScriptedEdgeLoader child(outcome, m_freedEdges);
            wire->AddEdge(dynamic_cast<VizEdge*>(child.Load()));
        }
        return m_keepWire ? wire : nullptr;
    }

private:
    bool const m_keepWire;
    Outcome const m_secondEdge;
    int& m_freedEdges;
};

class GroupedPMILoader : public AVizPMILoader {
public:
    explicit GroupedPMILoader(VizPMIType const* groupAndType) : m_groupAndType(groupAndType) {}

protected:
    VizElement* loadOne() override {
        if (m_groupAndType != nullptr)
            setGroupAndType(m_groupAndType[0], m_groupAndType[1]);
        return dynamic_cast<VizPMI*>(makeOne());
    }

private:
    VizPMIType const* const m_groupAndType;
};

} // namespace

TEST(AVizElementLoader, EachKindMakesItsOwnElementAndLoadHandsItOut) {
    struct Kind {
        std::string name;
        std::unique_ptr<VizElement> (*load)();
    } const kinds[] = {
        {"VizEdge", &loadWith<AVizEdgeLoader>},
        {"VizPoints", &loadWith<AVizPointsLoader>},
        {"VizPolygon", &loadWith<AVizPolygonLoader>},
        {"VizWire", &loadWith<AVizWireLoader>},
        {"VizPointSet", &loadWith<AVizPointSetLoader>},
        {"VizMesh", &loadWith<AVizMeshLoader>},
        {"VizFace", &loadWith<AVizFaceLoader>},
        {"VizText", &loadWith<AVizTextLoader>},
        {"VizView", &loadWith<AVizViewLoader>},
        {"VizCapture", &loadWith<AVizCaptureLoader>},
        {"VizPMI", &loadWith<AVizPMILoader>},
    };
    for (Kind const& kind : kinds) {
        // The element outlives its loader: it is the caller's.
        std::unique_ptr<VizElement> const element = kind.load();
        ASSERT_NE(element, nullptr) << kind.name;
        EXPECT_EQ(element->GetElementType(), kind.name);
        EXPECT_EQ(element->GetVisualID(), u"filled") << kind.name;
    }
}

// Run under the sanitizer build as well: a leak or double free of a dropped element fails.
TEST(AVizElementLoader, LoadFreesWhatLoadOneDidNotReturnAndNothingElse) {
    struct Case {
        Outcome outcome;
        bool returnsTheMadeElement;
        bool returnsAnything;
        int freedByLoad;
    } const cases[] = {
        {Outcome::ReturnIt, true, true, 0},     {Outcome::ReturnNull, false, false, 1},
        {Outcome::WrongClass, false, false, 1}, {Outcome::ReturnAnother, false, true, 1},
        {Outcome::MakeTwice, true, true, 1},    {Outcome::Throw, false, false, 1},
    };
    for (Case const& c : cases) {
        int freed = 0;
        ScriptedEdgeLoader loader(c.outcome, freed);
        std::unique_ptr<VizElement> result;
        if (c.outcome == Outcome::Throw)
            EXPECT_THROW(result.reset(loader.Load()), std::runtime_error);
        else
            result.reset(loader.Load());
        int const index = static_cast<int>(c.outcome);
        EXPECT_EQ(result.get() == loader.lastMade, c.returnsTheMadeElement) << index;
        EXPECT_EQ(result != nullptr, c.returnsAnything) << index;
        EXPECT_EQ(freed, c.freedByLoad) << index;
    }
}

TEST(AVizElementLoader, ASecondLoadGivesANewElementAndLeavesTheFirstToItsCaller) {
    int freed = 0;
    ScriptedEdgeLoader loader(Outcome::ReturnIt, freed);
    std::unique_ptr<VizElement> first(loader.Load());
    first->SetVisualID(u"first");
    std::unique_ptr<VizElement> const second(loader.Load());

    EXPECT_NE(first, second);
    EXPECT_EQ(loader.makes, 2) << "every run makes its own element";
    EXPECT_EQ(first->GetVisualID(), u"first") << "the first element is not touched";
    EXPECT_EQ(freed, 0);
    first.reset();
    EXPECT_EQ(freed, 1);
}

TEST(AVizElementLoader, ADroppedParentTakesItsLoadedChildrenWithIt) {
    struct Case {
        bool keepWire;
        Outcome secondEdge;
        int freedEdgesByLoad;
        std::size_t edgesOfTheWire;
    } const cases[] = {
        {true, Outcome::ReturnIt, 0, 2},
        {true, Outcome::ReturnNull, 1, 1}, // the parent goes on without the dropped child
        {false, Outcome::ReturnIt, 2, 0},
        {true, Outcome::Throw, 2, 0}, // the child's own edge, and the first with the wire
    };
    for (Case const& c : cases) {
        int freedEdges = 0;
        TwoEdgeWireLoader loader(c.keepWire, c.secondEdge, freedEdges);
        std::unique_ptr<VizElement> wire;
        if (c.secondEdge == Outcome::Throw)
            EXPECT_THROW(wire.reset(loader.Load()), std::runtime_error);
        else
            wire.reset(loader.Load());
        EXPECT_EQ(freedEdges, c.freedEdgesByLoad);
        if (wire != nullptr)
            EXPECT_EQ(dynamic_cast<VizWire&>(*wire).GetEdges().size(), c.edgesOfTheWire);
        else
            EXPECT_EQ(c.edgesOfTheWire, 0u);
    }
}

TEST(AVizPMILoader, APMIObjectIsMadeWithTheGroupAndTypeSetBeforeIt) {
    VizPMIType const groupAndType[] = {
        VizPMIType(VizPMIType::FirstNote, "VisuNoteGroup", Note),
        VizPMIType(static_cast<VizPMIType::ID>(3), "VisuNoteFlag", Note)};
    VizPMIType const undefined(VizPMIType::UndefinedPMI, "", UnknownPMI);

    GroupedPMILoader grouped(groupAndType);
    std::unique_ptr<VizElement> const element(grouped.Load());
    auto const* const pmi = dynamic_cast<VizPMI const*>(element.get());
    ASSERT_NE(pmi, nullptr);
    EXPECT_EQ(pmi->GetGroupType(), groupAndType[0]);
    EXPECT_EQ(pmi->GetType(), groupAndType[1]);

    GroupedPMILoader ungrouped(nullptr);
    std::unique_ptr<VizElement> const bare(ungrouped.Load());
    EXPECT_EQ(dynamic_cast<VizPMI&>(*bare).GetGroupType(), undefined);
    EXPECT_EQ(dynamic_cast<VizPMI&>(*bare).GetType(), undefined);
}
