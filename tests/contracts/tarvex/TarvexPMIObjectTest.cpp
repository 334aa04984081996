#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationIter.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationView.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDimension.h>

#include <gtest/gtest.h>

#include <typeinfo>

// A view hands out each annotation as the class of its record, so that the class it reports
// and the class behind the reference agree; a plain record reports only classes that have no
// object of their own.
TEST(TarvexPMIObject, AnnotationsComeAsTheClassTheyReport) {
    auto plain = [](TarvexPMIAnnotationType type) {
        auto record = std::make_shared<TarvexAuthoredPMIAnnotation>();
        record->objectType = type;
        return record;
    };
    auto flag = std::make_shared<TarvexAuthoredPMINote>();
    flag->objectType = TarvexPMI_FlagNote;
    TarvexAuthoredPMIAnnotationView view;
    view.annotations = {std::make_shared<TarvexAuthoredPMIDimension>(),
                        std::make_shared<TarvexAuthoredPMIGDT>(),
                        std::make_shared<TarvexAuthoredPMIDatum>(),
                        std::make_shared<TarvexAuthoredPMIDatumTarget>(),
                        std::make_shared<TarvexAuthoredPMIRoughness>(),
                        flag,
                        plain(TarvexPMI_GDT),
                        plain(static_cast<TarvexPMIAnnotationType>(12))};
    std::vector<int> const expected = {8, 7, 1, 2, 6, 4, 0, 12};

    TarvexModel model;
    TarvexPMIAnnotationIter annotations =
        model.MakePMIObject<TarvexPMIAnnotationView>(view).GetAnnotationIterator();
    EXPECT_EQ(annotations.GetCount(), 8);
    EXPECT_EQ(annotations.Current().GetObjectType(), TarvexPMI_UnknownType); // before Next
    std::vector<int> types;
    while (annotations.Next()) {
        TarvexPMIAnnotation& first = annotations.Current();
        EXPECT_EQ(&first, &annotations.Current()); // one object until the next Next
        types.push_back(first.GetObjectType());
    }
    EXPECT_EQ(types, expected);

    TarvexPMIAnnotationIter again =
        model.MakePMIObject<TarvexPMIAnnotationView>(view).GetAnnotationIterator();
    ASSERT_TRUE(again.Next());
    EXPECT_EQ(typeid(again.Current()), typeid(TarvexPMIDimension));

    // Every operation can be planned to throw.
    model.Faults().Add({"TarvexPMIAnnotationIter::Next", std::nullopt,
                        TarvexFaultKind::NonStdException, "", 1, 1});
    EXPECT_NO_THROW(again.Next());
    EXPECT_THROW(again.Next(), TarvexForeignError);
}
