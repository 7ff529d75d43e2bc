// OEDateTime, OETime and OEPayrollDateTime: parsing with its warnings, both text forms, seconds
// since 1970, zones and ordering. Runs under several TZ settings (tests.cmake): no expectation
// here may depend on the machine's zone.
#include "alloc_failure.h"
#include "values_testlog.h"

#include <cstdlib>
#include <cstring>
#include <random>
#include <string>

namespace {

const char* const kDT = "ConvertStringToOEDateTime";
const char* const kTM = "ConvertStringToOETime";
const char* const kTZ = "ExtractTimeZone";
const char* const kMismatch = "SetTimeZone (time zone mismatch";

std::string DateText(const OEDateTimeBase& d) {
    OEString s("<untouched>");
    d.GetDateString(s);
    return s.c_str();
}

std::string TimeText(const OEDateTimeBase& d) {
    OEString s("<untouched>");
    d.GetTimeString(s);
    return s.c_str();
}

// Days from 1970-01-01, counted year by year (independent of the library's arithmetic).
long long ReferenceDays(int y, int m, int d) {
    static const int kMonth[12] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    auto leap = [](int yr) { return yr % 4 == 0 && (yr % 100 != 0 || yr % 400 == 0); };
    long long days = 0;
    for (int yr = 1970; yr < y; ++yr) days += leap(yr) ? 366 : 365;
    for (int yr = y; yr < 1970; ++yr) days -= leap(yr) ? 366 : 365;
    for (int mo = 1; mo < m; ++mo) days += kMonth[mo - 1] + (mo == 2 && leap(y) ? 1 : 0);
    return days + d - 1;
}

class ValuesDateTime : public ::testing::Test {
protected:
    ScopedWarningLog log;
};

TEST_F(ValuesDateTime, ParseAndDateForm) {
    struct Case {
        const char* text;
        unsigned short ok;
        int warning; // -1 none; logged even when the parse succeeds
        const char* context;
        const char* form; // GetDateString after a successful parse
    } cases[] = {{"20240229", 1, -1, nullptr, "20240229"},
                 {"20000229", 1, -1, nullptr, "20000229"},
                 {"20230229", 0, OEPW_OUTOFRANGE, kDT, nullptr},
                 {"21000229", 0, OEPW_OUTOFRANGE, kDT, nullptr},
                 {"20241301", 0, OEPW_OUTOFRANGE, kDT, nullptr},
                 {"2024013", 0, OEPW_BADFORMAT, kDT, nullptr},
                 {"2024a131", 0, OEPW_BADFORMAT, kDT, nullptr},
                 {"20240131", 1, -1, nullptr, "20240131"},
                 {"2024013112", 1, -1, nullptr, "20240131120000"},
                 {"202401311200", 1, -1, nullptr, "20240131120000"},
                 {"20240131120000.5", 1, -1, nullptr, "20240131120000.005"},
                 {"20240131235959.999[-5:EST]", 1, -1, nullptr, "20240131235959.999[-5:EST]"},
                 {"20240131120000[+3]", 1, -1, nullptr, "20240131120000.000[3]"},
                 {"20240131120000[-4:EDT]", 1, -1, nullptr, "20240131120000.000[-4:EDT]"},
                 {"20240131120000[-5:PST]", 1, OEPW_BADFORMAT, kMismatch, "20240131120000.000[-5:PST]"},
                 {"20240131120000[0:GMT]", 1, -1, nullptr, "20240131120000"},
                 {"20240131[5.5]", 1, -1, nullptr, "20240131000000.000[5.50]"},
                 {"20240131[-3.5]", 1, -1, nullptr, "20240131000000.000[-3.50]"},
                 {"20240131[-0.5]", 1, -1, nullptr, "20240131000000.000[-0.50]"},
                 {"20240131[+5.45:IST]", 1, -1, nullptr, "20240131000000.000[5.45:IST]"},
                 {"20240131[-12]", 1, -1, nullptr, "20240131000000.000[-12]"},
                 {"20240131[]", 1, OEPW_BADFORMAT, kTZ, "20240131"},
                 {"20240131[-5:EST", 1, OEPW_BADFORMAT, kTZ, "20240131000000.000[-5:EST]"},
                 {"20240131[-5:ESTX]", 1, OEPW_BADFORMAT, kTZ, "20240131000000.000[-5:EST]"},
                 {"20240131[5.555]", 0, OEPW_BADFORMAT, kTZ, nullptr},
                 {"20230229[-5:PST]", 0, OEPW_OUTOFRANGE, kDT, nullptr}, // only the failure is logged
                 {"20240131[--5]", 0, OEPW_BADFORMAT, kTZ, nullptr},
                 {"20240131[5-]", 0, OEPW_BADFORMAT, kTZ, nullptr},
                 {"20240131[5.5.]", 0, OEPW_BADFORMAT, kTZ, nullptr},
                 {"20240131[:EST]", 0, OEPW_BADFORMAT, kTZ, nullptr},
                 {"20240131[-5]x", 0, OEPW_BADFORMAT, kTZ, nullptr},
                 {"20240131[13]", 0, OEPW_OUTOFRANGE, kTM, nullptr},
                 {"20240131-0500", 0, OEPW_BADFORMAT, kTM, nullptr},
                 {"20240131120000:00", 0, OEPW_BADFORMAT, kTM, nullptr},
                 {"2024013112000", 0, OEPW_BADFORMAT, kTM, nullptr},
                 {"20240131120000.1234", 0, OEPW_BADFORMAT, kTM, nullptr},
                 {"20240131120000.", 0, OEPW_BADFORMAT, kTM, nullptr},
                 {"20240131120000.5x", 0, OEPW_BADFORMAT, kTM, nullptr},
                 {"20240131246000", 0, OEPW_OUTOFRANGE, kTM, nullptr}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        OEDateTime d;
        EXPECT_EQ(c.ok, d.ConvertStringToOEDateTime(c.text));
        if (c.warning < 0)
            EXPECT_TRUE(log.None());
        else
            EXPECT_TRUE(log.ExactlyOne(static_cast<OEParseWarning>(c.warning), c.text, c.context));
        if (c.form) {
            EXPECT_EQ(c.form, DateText(d));
            OEDateTime again(DateText(d).c_str()); // the printed form reads back to the same instant
            EXPECT_TRUE(again == d);
            log.Clear();
        }
    }
    OEDateTime d("20240131");
    EXPECT_EQ(0, d.ConvertStringToOEDateTime(nullptr));
    EXPECT_TRUE(log.ExactlyOne(OEPW_NULLPOINTER, "", kDT));
    EXPECT_EQ(0, d.IsValidDate()); // cleared
    OETime t;
    EXPECT_EQ(0, t.ConvertStringToOETime(nullptr));
    EXPECT_TRUE(log.ExactlyOne(OEPW_NULLPOINTER, "", kTM));

    OEDateTime zone;
    EXPECT_EQ(1, zone.SetTimeZone("CDT", -6, 0)); // kept, but CDT is -5
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "CDT", kMismatch));
    EXPECT_STREQ("CDT", zone.GetTimeZone());
    EXPECT_EQ(1, zone.SetTimeZone("MDT", -6, 0));
    EXPECT_TRUE(log.None());
    {
        OEDateTime named;
        FailAllocations noMemory;
        EXPECT_EQ(0, named.ConvertStringToOEDateTime("20240131[-5:EST]"));
    }
    EXPECT_TRUE(log.ExactlyOne(OEPW_NULLPOINTER, "20240131[-5:EST]", kTM));
    OEThreadState::SetErrorCode(OETE_NONE);
}

TEST_F(ValuesDateTime, TimeForm) {
    struct Case {
        const char* text;
        unsigned short ok;
        const char* form;
    } cases[] = {{"120000.5", 1, "120000.5"},
                 {"120000.005", 1, "120000.5"},
                 {"120000.050", 1, "120000.50"},
                 {"120000[-5:EST]", 1, "120000[-5:EST]"},
                 {"1200[5.5:IST]", 1, "120000[5.50:IST]"},
                 {"235959.999[-3.5]", 1, "235959.999[-3.-50]"}, // the fraction keeps its sign here
                 {"120000[4.05]", 1, "120000[4.05]"},
                 {"[-0.5:NST]", 1, "000000:NST"},
                 {"[0:GMT]", 1, "000000:GMT"},
                 {"[0.5]", 1, "000000"},
                 {"12", 1, "120000"},
                 {"", 1, "000000"},
                 {"25", 0, nullptr},
                 {"1a", 0, nullptr}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        OETime t;
        EXPECT_EQ(c.ok, t.ConvertStringToOETime(c.text));
        if (c.form) {
            EXPECT_EQ(c.form, TimeText(t));
        }
        log.Clear();
    }
    // 5 milliseconds: padded in the date form, not in the time form.
    OEDateTime d(2024, 1, 31, 12, 0, 0, 5, 0, 0);
    EXPECT_EQ("20240131120000.005", DateText(d));
    EXPECT_EQ("120000.5", TimeText(d));
}

TEST_F(ValuesDateTime, Validity) {
    struct Case {
        short h, mi, s, ms, zh, zf;
        bool valid;
    } cases[] = {{23, 59, 59, 999, 12, 99, true}, {24, 0, 0, 0, 0, 0, false},   {0, 60, 0, 0, 0, 0, false},
                 {0, 0, 60, 0, 0, 0, false},      {0, 0, 0, 1000, 0, 0, false}, {0, 0, 0, 0, 13, 0, false},
                 {0, 0, 0, 0, -13, 0, false},     {0, 0, 0, 0, 0, 100, false},  {0, 0, 0, 0, -3, -150, true}};
    for (const Case& c : cases) {
        OEDateTime d(2024, 2, 29, c.h, c.mi, c.s, c.ms, c.zh, c.zf);
        EXPECT_EQ(c.valid, d.IsValidTime() != 0);
        EXPECT_EQ(c.valid, DateText(d) != "<untouched>");
    }
    EXPECT_EQ("<untouched>", DateText(OEDateTime()));
    EXPECT_EQ(29, OEDateTime::DaysInMonth(2, 2024));
    EXPECT_EQ(28, OEDateTime::DaysInMonth(2, 1900));
    EXPECT_EQ(0, OEDateTime::DaysInMonth(13, 2024));
    EXPECT_EQ(30, OEDateTime("20240415").DaysInMonth());
}

TEST_F(ValuesDateTime, SecondsSince1970) {
    struct Case {
        const char* text;
        long long seconds;
    } cases[] = {{"19700101", 0},
                 {"19691231235959", -1},
                 {"18991231", 2147483648LL},
                 {"19011231235959", 2147483648LL},
                 {"19020101", -2145916800LL},
                 {"19600229120000[-3.5]", -310465800LL},
                 {"20240131120000[-5:EST]", 1706720400LL},
                 {"20240131[5.5]", 1706639400LL},
                 {"20380119031407", 2147483647LL},
                 {"21000301", 4107542400LL}};
    for (const Case& c : cases) {
        EXPECT_EQ(c.seconds, OEDateTime(c.text).GetTimeT()) << c.text;
    }
    struct Back {
        long long seconds;
        const char* form;
    } back[] = {{0, "19700101"},
                {-1, "19691231235959"},
                {1706720400LL, "20240131170000"},
                {-2145916800LL, "19020101"},
                {-2208988800LL, "19000102"}, // four-year blocks: 1900 counts as a leap year
                {951782400LL, "20000229"},
                {4107542400LL, "21000301"},
                {32535215999LL, "30001231235959"}};
    for (const Back& b : back) {
        OEDateTime d("20240131[5:ABC]");
        d = b.seconds;
        EXPECT_EQ(b.form, DateText(d));       // zone cleared ...
        EXPECT_STREQ("ABC", d.GetTimeZone()); // ... name kept
    }
    OEDateTime d("20240131");
    EXPECT_EQ(0, d.AssignSeconds(32535216000LL));
    EXPECT_EQ(0, d.AssignSeconds(-62137324800LL)); // the year 0 by the blocks
    EXPECT_EQ(0, d.AssignSeconds(-9223372036854775807LL - 1));
    EXPECT_EQ("20240131", DateText(d));
    ASSERT_EQ(1, d.AssignSeconds(-2203977600LL)); // 1900-02-28 by the Gregorian rule
    EXPECT_EQ(2, d.GetMonth());
    EXPECT_EQ(29, d.GetDay());

    OEDateTime p(OEPrecisionInteger("1706720400.25"));
    EXPECT_EQ("20240131170000.250", DateText(p));
    p = OEPrecisionInteger("-0.5");
    EXPECT_EQ("19691231235959.500", DateText(p));
    // 2^93 + 1 seconds: times 1000 it would wrap to 1000 (1970-01-01 00:00:01).
    EXPECT_EQ(0, p.FromPrecInt(OEPrecisionInteger("9903520314283042199192993793")));
    EXPECT_EQ("19691231235959.500", DateText(p));
}

TEST_F(ValuesDateTime, ZoneConversionsAndAddition) {
    OEDateTime d("20240131120000.250[-5:EST]");
    ASSERT_EQ(1, d.ConvertToGMT());
    EXPECT_EQ("20240131170000", DateText(d));
    EXPECT_STREQ("EST", d.GetTimeZone());
    EXPECT_EQ(0, d.GetTimeZoneHours());

    OEDateTime l("20240131");
    ASSERT_EQ(1, l.ConvertToLocalTime(5, 50));
    EXPECT_EQ("20240131053000.000[5.50]", DateText(l));
    OEDateTime w("20240131020000[1]");
    ASSERT_EQ(1, w.ConvertToLocalTime(-5, 0));
    EXPECT_EQ("20240130200000.000[-5]", DateText(w));
    OEDateTime old("18991231");
    EXPECT_EQ(0, old.ConvertToGMT());
    EXPECT_EQ("18991231", DateText(old));

    OEDateTime a("20241231235959");
    a += 1LL;
    EXPECT_EQ("20250101", DateText(a));
    OEDateTime b("20240131120000[-5:EST]");
    b += 0LL;
    EXPECT_EQ("20240131170000", DateText(b));
    EXPECT_STREQ("", b.GetTimeZone());
    OEDateTime c("20240228");
    c += OEPrecisionInteger("86400.9");
    EXPECT_EQ("20240229", DateText(c));
    c += OEDateTime("19700102");
    EXPECT_EQ("20240301", DateText(c));
    c += -86400LL * 366;
    EXPECT_EQ("20230301", DateText(c));
    for (long long huge :
         {9223372036854775807LL, -9223372036854775807LL - 1, 32535215999LL - 1677628800LL + 1}) {
        c += huge; // refused, whatever the size: no overflow, no change
        EXPECT_EQ("20230301", DateText(c));
    }
    c += OEPrecisionInteger("9223372036854775807");
    EXPECT_EQ("20230301", DateText(c));
}

TEST_F(ValuesDateTime, OrderingAcrossZones) {
    struct Case {
        const char* a;
        const char* b;
        int cmp;
        const char* seconds; // b - a
    } cases[] = {{"20240131120000[-5:EST]", "20240131170000", 0, "0"},
                 {"20240131120000[-5]", "20240131120001[-4]", 1, "-3599"},
                 {"20240131000000.001", "20240131", 1, "-.001"},
                 {"20240131[5.5]", "20240130183000", 0, "0"},
                 {"20240131[-0.5]", "20240131", 1, "-1800"},
                 {"18000101", "19991231", -1, "6311260800"},
                 {"20240131120000[-5:EST]", "20240131170001.500", -1, "1.5"}};
    for (const Case& c : cases) {
        SCOPED_TRACE(std::string(c.a) + " vs " + c.b);
        OEDateTime a(c.a), b(c.b);
        EXPECT_EQ(c.cmp, a.compareDateTime(b));
        EXPECT_EQ(-c.cmp, b.compareDateTime(a));
        EXPECT_EQ(c.cmp == 0, a == b);
        EXPECT_EQ(c.cmp != 0, a != b);
        EXPECT_EQ(c.cmp < 0, a < b);
        EXPECT_EQ(c.cmp <= 0, a <= b);
        EXPECT_EQ(c.cmp > 0, a > b);
        EXPECT_EQ(c.cmp >= 0, a >= b);
        OEPrecisionInteger s = a.SecondsBetween(b);
        EXPECT_STREQ(c.seconds, static_cast<char*>(s));
    }
    OEDateTime a("20240131"), b("20250101");
    OEDateTime between = a.TimeBetween(b); // a copy of a itself, whatever the argument
    EXPECT_EQ("20240131", DateText(between));
}

TEST_F(ValuesDateTime, SetDay) {
    struct Case {
        unsigned short day, year;
        unsigned short ok;
        const char* form;
    } cases[] = {{1, 2024, 1, "20240101"},   {60, 2024, 1, "20240229"},  {60, 2023, 1, "20230301"},
                 {366, 2024, 1, "20241231"}, {365, 2023, 1, "20231231"}, {366, 2023, 0, "20000101"},
                 {0, 2024, 0, "20000101"}};
    for (const Case& c : cases) {
        OEDateTime d("20000101");
        EXPECT_EQ(c.ok, d.SetDay(c.day, c.year));
        EXPECT_EQ(c.form, DateText(d));
    }
}

TEST_F(ValuesDateTime, BinaryRecordAndCopies) {
    OEDateTime d("20240131235959.999[-3.5:NST]");
    log.Clear();
    unsigned char rec[24];
    unsigned long size = 0;
    ASSERT_EQ(1, d.ExportBinary(rec, &size));
    EXPECT_EQ(24u, size);
    EXPECT_EQ(1, rec[0]);
    EXPECT_EQ(0, rec[1]);
    EXPECT_EQ(0xE8, rec[2]); // 2024 = 0x07E8
    EXPECT_EQ(0x07, rec[3]);
    OEDateTime back;
    ASSERT_EQ(1, back.ImportBinary(rec));
    EXPECT_EQ("20240131235959.999[-3.50:NST]", DateText(back));
    rec[0] = 9;
    EXPECT_EQ(0, back.ImportBinary(rec));
    unsigned char* block = d.LockBuffer();
    ASSERT_NE(nullptr, block);
    EXPECT_EQ(block, d.LockBuffer());
    d.UnLockBuffer();
}

TEST_F(ValuesDateTime, PayrollDateTime) {
    struct Case {
        const char* text;
        unsigned short ok, empty;
        const char* form;
    } cases[] = {{"^@~*", 1, 1, "^@~*"},
                 {"__OFX_EMPTY_STRING__", 1, 1, "^@~*"},
                 {"20240131", 1, 0, "20240131"},
                 {"2024", 0, 0, nullptr}};
    for (const Case& c : cases) {
        OEPayrollDateTime p;
        p.SetEmpty(1);
        EXPECT_EQ(c.ok, p.Assign(c.text));
        EXPECT_EQ(c.empty, p.IsEmpty());
        if (c.form) {
            EXPECT_EQ(c.form, DateText(p));
        }
        log.Clear();
    }
    OEPayrollDateTime p(2024, 1, 31, 12, 0, 0, 0);
    EXPECT_EQ("20240131120000", DateText(p));
    p = "^@~*";
    OEPayrollDateTime copy;
    copy = p;
    EXPECT_EQ(1, copy.IsEmpty());
    copy = 86400LL; // from seconds, as any date-time: no longer empty
    EXPECT_EQ("19700102", DateText(copy));
    p = OEPrecisionInteger("0.5");
    EXPECT_EQ("19700101000000.500", DateText(p));
    EXPECT_TRUE(log.None());
}

TEST_F(ValuesDateTime, HostOffsetComesFromThePlatform) {
    const long long offset = OEDateTime::LocalTimeZoneOffset();
    EXPECT_EQ(0, offset % 900);
    EXPECT_LE(offset < 0 ? -offset : offset, 14 * 3600);
#if !defined(_WIN32)
    const char* tz = std::getenv("TZ");
    if (tz && std::strcmp(tz, "UTC") == 0) {
        EXPECT_EQ(0, offset);
    }
    if (tz && std::strcmp(tz, "Asia/Kolkata") == 0) {
        EXPECT_EQ(19800, offset);
    }
    if (tz && std::strcmp(tz, "America/New_York") == 0) {
        EXPECT_TRUE(offset == -18000 || offset == -14400);
    }
#endif
}

// Random valid date-times from 1902 to 2100.
TEST_F(ValuesDateTime, RandomRoundTrips) {
    std::mt19937 rng(1902);
    for (int i = 0; i < 5000; ++i) {
        const short year = static_cast<short>(1902 + rng() % 199);
        const short month = static_cast<short>(1 + rng() % 12);
        const short day = static_cast<short>(1 + rng() % OEDateTime::DaysInMonth(month, year));
        const short hour = static_cast<short>(rng() % 24), minute = static_cast<short>(rng() % 60),
                    second = static_cast<short>(rng() % 60);
        const short ms = static_cast<short>(rng() % 2 ? rng() % 1000 : 0);
        const short zh = static_cast<short>(rng() % 3 ? static_cast<int>(rng() % 25) - 12 : 0);
        const short zfAbs = static_cast<short>(rng() % 2 ? 0 : 25 * (rng() % 4));
        const short zf = static_cast<short>(zh < 0 || (zh == 0 && rng() % 2) ? -zfAbs : zfAbs);
        OEDateTime d(year, month, day, hour, minute, second, ms, zh, zf);
        if (zh > 0) d.SetTimeZone("ZZZ", zh, zf);

        // text -> value -> text
        const std::string form = DateText(d);
        OEDateTime parsed;
        ASSERT_EQ(1, parsed.ConvertStringToOEDateTime(form.c_str())) << form;
        ASSERT_EQ(form, DateText(parsed));
        ASSERT_TRUE(parsed == d) << form;
        ASSERT_EQ(ms, parsed.GetMillisecond());
        ASSERT_EQ(zf, parsed.GetTimeZoneFraction());

        // value -> seconds (checked against a year-by-year day count) -> value
        const long long t = d.GetTimeT();
        const long long expected = ReferenceDays(year, month, day) * 86400 + hour * 3600 + minute * 60 +
                                   second - (zh * 100 + zf) * 36;
        ASSERT_EQ(expected, t) << form;
        OEDateTime utc;
        ASSERT_EQ(1, utc.AssignSeconds(t));
        ASSERT_EQ(0, utc.compareDateTime(OEDateTime(year, month, day, hour, minute, second, 0, zh, zf)))
            << form;
        if (zh == 0 && zf == 0) {
            ASSERT_EQ(day, utc.GetDay());
            ASSERT_EQ(hour, utc.GetHour());
        }
    }
    EXPECT_TRUE(log.None());
}

} // namespace
