#include <VizBridge/contracts/kolba/AVizEdgeLoader.h>

#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>
#include <tuple>

using namespace KolbaVizCore;

// Run under the sanitizer build as well: a leak or a double free of a dropped element fails.
namespace {

/// Counts its own destruction, so that a test tells that it was freed, and freed once.
struct CountedEdge : VizEdge {
    explicit CountedEdge(int& freed) : freed(freed) {}
    ~CountedEdge() override { ++freed; }
    int& freed;
};

enum class Outcome { ReturnIt, ReturnNull, MakeTwice, Throw };

/// An edge loader whose loadOne ends as told.
struct ScriptedEdgeLoader : AVizEdgeLoader {
    ScriptedEdgeLoader(Outcome outcome, int& freed) : outcome(outcome), freed(freed) {}
    VizElement* makeOne() override { return keep(std::make_unique<CountedEdge>(freed)); }
    VizElement* loadOne() override {
        VizElement* const made = makeOne();
        switch (outcome) {
        case Outcome::ReturnNull:
            return nullptr;
        case Outcome::MakeTwice:
            return makeOne();
        case Outcome::Throw:
            throw std::runtime_error("source unreadable");
        default:
            return made;
        }
    }
    Outcome outcome;
    int& freed;
};

} // namespace

// Each loader runs twice and its caller keeps both results: a second run must leave the
// first one's element alone.
TEST(AVizElementLoader, LoadFreesWhatLoadOneMadeButDidNotReturnAlsoOnAThrow) {
    // How loadOne ends, whether Load hands out an element, what it frees over the two runs.
    std::tuple<Outcome, bool, int> const cases[] = {
        {Outcome::ReturnIt, true, 0},
        {Outcome::ReturnNull, false, 2},
        {Outcome::MakeTwice, true, 2},
        {Outcome::Throw, false, 2},
    };
    for (auto const& [outcome, handsOut, freedByLoad] : cases) {
        SCOPED_TRACE(static_cast<int>(outcome));
        int freed = 0;
        ScriptedEdgeLoader loader(outcome, freed);
        std::unique_ptr<VizElement> results[2];
        for (std::unique_ptr<VizElement>& result : results) {
            if (outcome == Outcome::Throw)
                EXPECT_THROW(result.reset(loader.Load()), std::runtime_error);
            else
                result.reset(loader.Load());
            EXPECT_EQ(result != nullptr, handsOut);
        }
        EXPECT_TRUE(results[0] == nullptr || results[0] != results[1]) << "a new one per run";
        EXPECT_EQ(freed, freedByLoad);
    }
}
