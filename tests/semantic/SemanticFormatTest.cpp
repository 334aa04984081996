#include <VizBridge/semantic/SemanticFormat.h>

#include <gtest/gtest.h>

using namespace VizBridgeTarvex;

TEST(SemanticFormat, ValuesPrintAsWritten) {
    float const two[] = {1, 2.5f};
    float const four[] = {-0.5f, 0, 1, 0.25f};
    double const three[] = {10, 0.01, -3};
    std::vector<std::pair<WString, char16_t const*>> const rows = {
        {FormatFloat(0), u"0.000000"},
        {FormatFloat(-0.5f), u"-0.500000"},
        {FormatFloat(1.5f), u"1.500000"},
        {FormatDouble(10), u"10.000000"},
        {FormatDouble(0.01), u"0.010000"},
        {FormatInt(-3), u"-3"},
        {FormatBool(true), u"true"},
        {FormatBool(false), u"false"},
        {FormatFloats(2, two), u"(1.000000, 2.500000)"},
        {FormatFloats(4, four), u"(-0.500000, 0.000000, 1.000000, 0.250000)"},
        {FormatDoubles(3, three), u"(10.000000, 0.010000, -3.000000)"},
        {FormatDoubles(1, three), u"(10.000000)"},
        {FormatDoubles(0, three), u""},
        {FormatFloats(2, nullptr), u""},
        {FormatEntityId(KolbaVizCore::EntityId(7, 3, 101)), u"[7, 3, 101]"},
        {JoinStrings({}, u", "), u""},
        {JoinStrings({u"A"}, u", "), u"A"},
        {JoinStrings({u"A", u"", u"C"}, u", "), u"A, , C"},
        {ToWString(TarvexWString(u"Ra 1.6")), u"Ra 1.6"},
        {ToWString(TarvexWString()), u""},
        {ToWString(TarvexWString(u"")), u""},
    };
    for (std::size_t row = 0; row < rows.size(); ++row) {
        EXPECT_EQ(rows[row].first, rows[row].second) << "row " << row;
    }
}

// A tuple is built in one buffer of 1024 characters and a number in one of 64: what does not
// fit is cut, and the start stays exact.
TEST(SemanticFormat, BuffersAreRespected) {
    double const huge[] = {1e300, 1e300, 1e300, 1e300};
    WString const tuple = FormatDoubles(4, huge);
    EXPECT_EQ(tuple.size(), 1023u);
    EXPECT_EQ(tuple.substr(0, 3), u"(10");
    EXPECT_EQ(FormatDouble(1e300).size(), 63u);
}
