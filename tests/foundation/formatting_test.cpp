// The allocation-free formatting functions the builder writes through: OEPrecisionInteger's
// FormatText and OEDateTimeBase's FormatDate must give exactly the texts of operator char* and
// GetDateString, across the cases where their fast paths end (64-bit magnitudes, fractions with
// and without an integer part, five-digit years, zones).
#include "oesdk.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>

namespace {

__extension__ typedef unsigned __int128 U128;

OEPrecisionInteger Number(U128 mag, bool negative, unsigned short scale) {
    OEPrecisionInteger n(static_cast<unsigned long long>(mag >> 32), 0);
    n <<= 32;
    n += OEPrecisionInteger(static_cast<unsigned long long>(mag & 0xFFFFFFFFu), 0);
    n.SetDecimal(scale);
    if (negative) n.Negate();
    return n;
}

TEST(FormatFunctions, NumberTextEqualsTheConversionOperator) {
    const U128 two64 = static_cast<U128>(1) << 64;
    const struct {
        U128 mag;
        bool negative;
        unsigned short scale;
        const char* text;
    } cases[] = {
        {0, false, 0, "0"},
        {0, false, 3, "0"}, // Negate keeps a zero positive
        {7, false, 0, "7"},
        {10, false, 1, "1"},
        {1000, true, 2, "-10"},
        {1005, false, 2, "10.05"},
        {50, false, 2, ".5"},
        {5, true, 3, "-.005"},
        {99, false, 2, ".99"},
        {100, false, 2, "1"},
        {1, false, 29, ".00000000000000000000000000001"},
        {two64 - 1, false, 0, "18446744073709551615"},
        {two64 - 1, true, 20, "-.18446744073709551615"},
        {two64 - 1, false, 5, "184467440737095.51615"},
        {two64, false, 0, "18446744073709551616"},
        {two64 * 10, false, 1, "18446744073709551616"},
        {two64 + 5, false, 25, ".0000018446744073709551621"},
        {(static_cast<U128>(1) << 96) - 1, true, 1, "-7922816251426433759354395033.5"},
    };
    for (const auto& c : cases) {
        OEPrecisionInteger n = Number(c.mag, c.negative, c.scale);
        char text[OEPrecisionInteger::kTextSize];
        const unsigned short length = n.FormatText(text);
        EXPECT_STREQ(text, c.text);
        EXPECT_EQ(length, std::strlen(c.text)) << c.text;
        EXPECT_STREQ(static_cast<char*>(n), c.text);
    }
}

TEST(FormatFunctions, DateTextEqualsGetDateString) {
    const struct {
        OEDateTime date;
        const char* text; // null: refused
    } cases[] = {
        {OEDateTime(2024, 1, 31, 0, 0, 0, 0, 0, 0), "20240131"},
        {OEDateTime(7, 3, 4, 0, 0, 0, 0, 0, 0), "00070304"},
        {OEDateTime(12345, 12, 31, 0, 0, 0, 0, 0, 0), "123451231"},
        {OEDateTime(2024, 1, 31, 0, 0, 1, 0, 0, 0), "20240131000001"},
        {OEDateTime(2024, 1, 31, 23, 59, 59, 7, 0, 0), "20240131235959.007"},
        {OEDateTime(2024, 1, 31, 9, 5, 0, 0, -12, 0), "20240131090500.000[-12]"},
        {OEDateTime(2024, 1, 31, 0, 0, 0, 0, 0, -30), "20240131000000.000[-0.30]"},
        {OEDateTime(2024, 1, 31, 0, 0, 0, 120, 5, 45), "20240131000000.120[5.45]"},
        {OEDateTime(2024, 1, 31, 0, 0, 0, 0, 3, -1234), "20240131000000.000[3.1234]"},
        {OEDateTime(2023, 2, 29, 0, 0, 0, 0, 0, 0), nullptr},
        {OEDateTime(2024, 1, 31, 24, 0, 0, 0, 0, 0), nullptr},
        {OEDateTime(2024, 1, 31, 0, 0, 0, 1000, 0, 0), nullptr},
    };
    for (const auto& c : cases) {
        char text[OEDateTimeBase::kDateTextSize];
        const unsigned short length = c.date.FormatDate(text);
        OEString viaString("untouched");
        const unsigned short ok = c.date.GetDateString(viaString);
        if (!c.text) {
            EXPECT_EQ(length, 0);
            EXPECT_EQ(ok, 0);
            EXPECT_STREQ(viaString.c_str(), "untouched");
            continue;
        }
        EXPECT_EQ(std::string(text, length), c.text);
        EXPECT_EQ(ok, 1);
        EXPECT_STREQ(viaString.c_str(), c.text);
    }
    // A name longer than three letters (SetTimeZone keeps it as given) is written cut to three.
    OEDateTime named("20240131120000[-5:EST]"), longName(2024, 1, 31, 0, 0, 0, 0, 0, 0);
    longName.SetTimeZone(std::string(200, 'Z').c_str(), 2, 0);
    char text[OEDateTimeBase::kDateTextSize];
    EXPECT_EQ(std::string(text, named.FormatDate(text)), "20240131120000.000[-5:EST]");
    EXPECT_EQ(std::string(text, longName.FormatDate(text)), "20240131000000.000[2:ZZZ]");
    OEString time;
    ASSERT_EQ(longName.GetTimeString(time), 1);
    EXPECT_STREQ(time.c_str(), "000000[2:ZZZ]");
}

} // namespace
