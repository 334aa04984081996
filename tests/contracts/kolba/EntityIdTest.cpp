#include <VizBridge/contracts/kolba/EntityId.h>

#include <gtest/gtest.h>

#include <map>
#include <vector>

using KolbaVizCore::EntityId;

TEST(EntityId, DefaultNamesNothing) {
    EntityId const id;
    EXPECT_EQ(id.GetType(), 0xFFFFFFFFu);
    EXPECT_EQ(id.GetId(), 0u);
    EXPECT_EQ(id.GetParentId(), 0u);
    EXPECT_FALSE(id.IsValid());
    EXPECT_FALSE(id.IsAnnotation());
}

TEST(EntityId, ConstructorTakesParentTypeAndIdInThatOrder) {
    EntityId id(7, KolbaVizCore::Face, 42);
    EXPECT_EQ(id.GetParentId(), 7u);
    EXPECT_EQ(id.GetType(), static_cast<std::uint32_t>(KolbaVizCore::Face));
    EXPECT_EQ(id.GetId(), 42u);
    EXPECT_TRUE(id.IsValid());

    id.SetId(1);
    id.SetParentId(2);
    id.SetType(KolbaVizCore::Edge);
    EXPECT_EQ(id, EntityId(2, KolbaVizCore::Edge, 1));
}

TEST(EntityId, OrdersByIdThenParentThenType) {
    // Listed in ascending order: an earlier word outweighs every later one.
    std::vector<EntityId> const ascending = {
        EntityId(9, 10005, 1), // a higher parent and type do not outweigh a lower id
        EntityId(0, 10000, 2), EntityId(0, 10001, 2),
        EntityId(1, 10000, 2), // a higher parent outweighs a lower type
        EntityId(1, 10002, 2), EntityId(0, 10000, 3),
    };
    for (std::size_t i = 0; i + 1 < ascending.size(); ++i) {
        SCOPED_TRACE(i);
        EXPECT_TRUE(ascending[i] < ascending[i + 1]);
        EXPECT_FALSE(ascending[i + 1] < ascending[i]);
        EXPECT_NE(ascending[i], ascending[i + 1]);
    }
    EXPECT_FALSE(ascending[0] < ascending[0]);

    // As the key of a link map: equal ids meet in one entry.
    std::map<EntityId, int> links;
    links[EntityId(1, 10001, 5)] = 1;
    links[EntityId(1, 10001, 5)] = 2;
    links[EntityId(1, 10002, 5)] = 3;
    EXPECT_EQ(links.size(), 2u);
    EXPECT_EQ(links.at(EntityId(1, 10001, 5)), 2);
}

TEST(EntityId, AnnotationKindsArePMIAndTheDetailedPMIKinds) {
    struct Case {
        std::uint32_t type;
        bool annotation;
    } const cases[] = {
        {KolbaVizCore::Face, false},
        {KolbaVizCore::PMI, true},
        {KolbaVizCore::Views, false},
        {KolbaVizCore::Captures, false},
        {10099u, false},
        {KolbaVizCore::UnknownPMI, true},
        {KolbaVizCore::Note, true},
        {KolbaVizCore::GeomTol, true},
        {KolbaVizCore::Roughness, true},
        {10106u, false},
        {KolbaVizCore::FTAGeometry, false},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.type);
        EXPECT_EQ(EntityId(0, c.type, 1).IsAnnotation(), c.annotation);
    }
}
