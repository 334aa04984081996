#include <VizBridge/contracts/kolba/SemanticPMI.h>

#include <gtest/gtest.h>

using KolbaVizCore::SemanticPMI;

TEST(SemanticPMI, ToStringOfAnEmptyRecordHasTheThreeNameLines) {
    EXPECT_EQ(SemanticPMI().ToString(), u"Name : \nLabel : \nID : \n");
}

TEST(SemanticPMI, ToStringListsPropertiesInKeyOrderAfterTheNames) {
    SemanticPMI record;
    record.Name = u"Datum A";
    record.Label = u"A";
    record.ID = u"12";
    record.Properties[u"Hidden"] = u"false";
    record.Properties[u"angle"] = u"1.500000";
    record.Properties[u"Angle"] = u"0.000000";
    record.Properties[u"_0Upper"] = u"2";
    record.Properties[u"0_Rough"] = u"Ra";
    record.Properties[u"Hidden"] = u"true"; // a second write replaces the value
    record.BREPLinks.emplace_back(1, KolbaVizCore::Face, 2);

    // Digits before upper case, upper case before "_", "_" before lower case; links unprinted.
    EXPECT_EQ(record.ToString(), u"Name : Datum A\n"
                                 u"Label : A\n"
                                 u"ID : 12\n"
                                 u"0_Rough : Ra\n"
                                 u"Angle : 0.000000\n"
                                 u"Hidden : true\n"
                                 u"_0Upper : 2\n"
                                 u"angle : 1.500000\n");
}
