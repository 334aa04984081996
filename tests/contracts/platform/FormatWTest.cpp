#include <VizBridge/contracts/platform/FormatW.h>

#include <gtest/gtest.h>

#include <cfloat>
#include <climits>
#include <clocale>
#include <cstdio>
#include <limits>
#include <locale>
#include <stdexcept>
#include <string>
#include <vector>

using VizPort::FormatW;
using VizPort::Widen;
using VizPort::WString;

namespace {

struct FormatCase {
    char const* name;
    WString actual;
    WString expected;
};

void expectCases(std::vector<FormatCase> const& cases) {
    for (FormatCase const& c : cases) {
        SCOPED_TRACE(c.name);
        EXPECT_EQ(c.actual, c.expected);
    }
}

// What the C library prints for "%f" while the C locale is in force.
WString printfFixed(double value) {
    char buffer[512];
    std::snprintf(buffer, sizeof buffer, "%f", value);
    return Widen(buffer);
}

} // namespace

TEST(FormatW, PrintsEachConversion) {
    char16_t const* const text = u"part";
    expectCases({
        {"plain text", FormatW(64, u"no conversions", {}), u"no conversions"},
        {"%s", FormatW(64, u"<%s>", {text}), u"<part>"},
        {"%s keeps characters above 0xFF", FormatW(64, u"%s", {u"\u03A9\u00E9\u4E2D"}),
         u"\u03A9\u00E9\u4E2D"},
        {"%d", FormatW(64, u"%d", {42}), u"42"},
        {"%d negative", FormatW(64, u"%d", {-7}), u"-7"},
        {"%d smallest", FormatW(64, u"%d", {INT_MIN}), u"-2147483648"},
        {"%d largest", FormatW(64, u"%d", {INT_MAX}), u"2147483647"},
        {"%lu zero", FormatW(64, u"%lu", {0ul}), u"0"},
        {"%lu above 32 bits", FormatW(64, u"%lu", {4294967296ul}), u"4294967296"},
        {"%lu largest", FormatW(64, u"%lu", {ULONG_MAX}), Widen(std::to_string(ULONG_MAX))},
        {"%f", FormatW(64, u"%f", {1.5}), u"1.500000"},
        {"%%", FormatW(64, u"100%%", {}), u"100%"},
        {"%% takes no argument", FormatW(64, u"%%%d", {3}), u"%3"},
        {"several in order", FormatW(1024, u"%s (RefID %d) Error : %s", {u"Load", 12, u"bad"}),
         u"Load (RefID 12) Error : bad"},
        {"mixed kinds", FormatW(128, u"[%d, %lu, %f]", {1, 10005ul, -2.25}),
         u"[1, 10005, -2.250000]"},
    });
}

TEST(FormatW, FixedNotationMatchesPrintf) {
    double const values[] = {0.0,
                             -0.0,
                             1.0,
                             -1.0,
                             0.1,
                             1.0 / 3.0,
                             2.0 / 3.0,
                             0.0000005,
                             0.0000015,
                             -0.000000001, // rounds to a negative zero
                             123456789.123456789,
                             1e15,
                             1e22,
                             1e300,
                             DBL_MAX,
                             -DBL_MAX,
                             DBL_MIN,
                             std::numeric_limits<double>::denorm_min(),
                             std::numeric_limits<double>::infinity(),
                             -std::numeric_limits<double>::infinity()};
    for (double const value : values) {
        SCOPED_TRACE(value);
        EXPECT_EQ(FormatW(512, u"%f", {value}), printfFixed(value));
    }
    EXPECT_EQ(FormatW(64, u"%f", {-0.0}), u"-0.000000");
    EXPECT_EQ(FormatW(64, u"%f", {-1e-9}), u"-0.000000");
}

TEST(FormatW, NotANumberPrintsAsNan) {
    WString const text = FormatW(64, u"%f", {std::numeric_limits<double>::quiet_NaN()});
    EXPECT_NE(text.find(u"nan"), WString::npos) << "got: " << VizPort::Narrow(text);
}

TEST(FormatW, CutsToOneLessThanTheBuffer) {
    WString const huge = FormatW(512, u"%f", {DBL_MAX});
    expectCases({
        {"no buffer", FormatW(0, u"abc", {}), u""},
        {"room for the terminator only", FormatW(1, u"abc", {}), u""},
        {"one short of fitting", FormatW(3, u"abc", {}), u"ab"},
        {"exactly fitting", FormatW(4, u"abc", {}), u"abc"},
        {"more than enough", FormatW(5, u"abc", {}), u"abc"},
        {"inside a text argument", FormatW(4, u"<%s>", {u"abcdef"}), u"<ab"},
        {"inside a number", FormatW(4, u"%d", {-123456}), u"-12"},
        {"inside a long number", FormatW(6, u"x%lu", {ULONG_MAX}), u"x1844"},
        {"inside a double", FormatW(5, u"%f", {3.14159}), u"3.14"},
        {"at a percent sign", FormatW(3, u"ab%%", {}), u"ab"},
        {"a huge double is cut, not overrun", FormatW(17, u"%f", {DBL_MAX}), huge.substr(0, 16)},
        {"unbounded buffer", FormatW(std::numeric_limits<std::size_t>::max(), u"%d", {5}), u"5"},
    });
    EXPECT_EQ(huge.size(), 316u) << "309 digits, the point and six decimals";
}

TEST(FormatW, BadFormatsAndArgumentsPrintNothingInTheirPlace) {
    char16_t const* const nullText = nullptr;
    expectCases({
        {"null text", FormatW(64, u"<%s>", {nullText}), u"<>"},
        {"null format", FormatW(64, nullptr, {1}), u""},
        {"missing argument", FormatW(64, u"<%d>", {}), u"<>"},
        {"missing second argument", FormatW(64, u"%d-%d", {1}), u"1-"},
        {"double for %d", FormatW(64, u"<%d>", {1.5}), u"<>"},
        {"int for %f", FormatW(64, u"<%f>", {1}), u"<>"},
        {"int for %lu", FormatW(64, u"<%lu>", {1}), u"<>"},
        {"unsigned long for %d", FormatW(64, u"<%d>", {1ul}), u"<>"},
        {"int for %s", FormatW(64, u"<%s>", {1}), u"<>"},
        {"text for %d", FormatW(64, u"<%d>", {u"1"}), u"<>"},
        {"a mismatch still uses up its argument", FormatW(64, u"%d|%d", {2.0, 7}), u"|7"},
        {"surplus arguments are ignored", FormatW(64, u"%d", {1, 2, 3}), u"1"},
        {"unknown conversion", FormatW(64, u"%x", {3}), u"%x"},
        {"unknown conversion takes no argument", FormatW(64, u"%x%d", {3}), u"%x3"},
        {"width is not understood", FormatW(64, u"%5d", {3}), u"%5d"},
        {"%l without u", FormatW(64, u"%ld|%lu", {9ul}), u"%ld|9"},
        {"%l at the end", FormatW(64, u"50%l", {}), u"50%l"},
        {"lone percent at the end", FormatW(64, u"50%", {}), u"50%"},
    });
}

namespace {

/// Puts a locale with a decimal comma in force for C and C++, and restores both.
class CommaLocale {
public:
    CommaLocale() : m_previousCpp(std::locale()) {
        char const* const current = std::setlocale(LC_ALL, nullptr);
        m_previousC = current ? current : "C";
        for (char const* name : {"de_DE.UTF-8", "de_DE.utf8", "de_DE", "fr_FR.UTF-8", "fr_FR.utf8",
                                 "nl_NL.UTF-8", "ru_RU.UTF-8"}) {
            if (std::setlocale(LC_ALL, name) == nullptr)
                continue;
            if (*std::localeconv()->decimal_point != ',')
                continue;
            try {
                std::locale::global(std::locale(name));
            } catch (std::runtime_error const&) {
                continue;
            }
            m_active = true;
            return;
        }
        std::setlocale(LC_ALL, m_previousC.c_str());
    }
    ~CommaLocale() {
        std::locale::global(m_previousCpp);
        std::setlocale(LC_ALL, m_previousC.c_str());
    }
    CommaLocale(CommaLocale const&) = delete;
    CommaLocale& operator=(CommaLocale const&) = delete;

    bool IsActive() const { return m_active; }

private:
    std::locale m_previousCpp;
    std::string m_previousC;
    bool m_active = false;
};

} // namespace

TEST(FormatW, NumbersIgnoreTheProcessLocale) {
    CommaLocale const locale;
    if (!locale.IsActive())
        GTEST_SKIP() << "no locale with a decimal comma is installed";
    char check[32];
    std::snprintf(check, sizeof check, "%.1f", 1.5);
    ASSERT_STREQ(check, "1,5") << "the comma locale is not in force";

    EXPECT_EQ(FormatW(64, u"%f", {1.5}), u"1.500000");
    EXPECT_EQ(FormatW(64, u"%d", {1234567}), u"1234567");
    EXPECT_EQ(FormatW(64, u"%lu", {1234567ul}), u"1234567");
}
