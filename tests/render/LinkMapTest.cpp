// LinkMap against the walks it stands for: a std::map filled with emplace (the first path of
// a key stays) and read in key order.
#include "support/LinkMapWalk.h"
#include <VizBridge/render/LinkMap.h>

#include <gtest/gtest.h>

#include <map>
#include <random>
#include <string>
#include <vector>

using namespace VizBridgeTarvex;

namespace {

using namespace VizBridgeTest;

std::vector<std::pair<EntityId, RenderId>> inOrder(Records const& records) {
    return {records.begin(), records.end()};
}

/// A random scene's records: paths that share heads, keys that collide.
struct RandomRecords {
    explicit RandomRecords(unsigned seed) : random(seed) {
        for (int i = 0; i < 300; ++i) {
            RenderId path = i > 0 && pick(4) != 0 ? added[pick(added.size())] : RenderId(1);
            if (pick(10) == 0)
                path.SetLeading(pick(2));
            for (std::size_t extra = pick(3); extra > 0 && path.Length() < 8; --extra)
                path.AddValue(static_cast<std::uint32_t>(pick(4)));
            add(path);
            if (pick(3) == 0)
                add(path); // a part: the same path under a second key
        }
    }
    std::size_t pick(std::size_t below) {
        return std::uniform_int_distribution<std::size_t>(0, below - 1)(random);
    }
    void add(RenderId const& path) {
        EntityId const key(static_cast<std::uint32_t>(pick(5)), static_cast<std::uint32_t>(pick(3)),
                           static_cast<std::uint32_t>(pick(40)));
        map.Add(key, path);
        walked.emplace(key, path);
        added.push_back(path);
    }
    std::mt19937 random;
    LinkMap map;
    Records walked;
    std::vector<RenderId> added;
};

} // namespace

TEST(LinkMap, AnswersAsTheWalksInKeyOrderOnRandomScenes) {
    for (unsigned seed = 1; seed <= 100; ++seed) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        RandomRecords scene(seed);
        Answer before;
        ASSERT_FALSE(scene.map.FindLongestPrefix(scene.added[0], before.key, before.path))
            << "nothing before Finish";
        scene.map.Finish();
        ASSERT_EQ(scene.map.Records(), inOrder(scene.walked));
        for (int query = 0; query < 100; ++query) {
            RenderId id = scene.added[scene.pick(scene.added.size())];
            if (scene.pick(2) == 0)
                id.SetLength(
                    static_cast<int>(scene.pick(static_cast<std::size_t>(id.Length()) + 3)));
            if (scene.pick(8) == 0)
                id.SetLeading(static_cast<std::uint32_t>(scene.pick(3)));
            Answer got;
            got.found = scene.map.FindLongestPrefix(id, got.key, got.path);
            ASSERT_EQ(got, walkLongestPrefix(scene.walked, id)) << "query " << query;
            auto const wanted = static_cast<std::uint32_t>(scene.pick(45));
            Answer first;
            first.found = scene.map.FindFirstWithId(wanted, first.key, first.path);
            ASSERT_EQ(first, walkFirstWithId(scene.walked, wanted));
            RenderId path;
            EntityId const key = first.found ? first.key : EntityId(1, 2, wanted);
            auto const entry = scene.walked.find(key);
            ASSERT_EQ(scene.map.Find(key, path), entry != scene.walked.end());
            ASSERT_TRUE(entry == scene.walked.end() || path == entry->second);
        }
        // Records added after a Finish join the rest; a key's first path still stays.
        scene.add(scene.added[0]);
        scene.map.Finish();
        ASSERT_EQ(scene.map.Records(), inOrder(scene.walked));
    }
    LinkMap map;
    map.Add(EntityId(1, 2, 3), RenderId(1));
    map.Finish();
    map.Clear();
    EXPECT_TRUE(map.IsEmpty() && map.Records().empty() && map.HeapBytes() == 0);
}
