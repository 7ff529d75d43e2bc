// OEPrecisionInteger, OEPercent and OEPosPrecisionInteger: text forms, arithmetic, accessors and
// the binary record, plus property checks against exact 128-bit arithmetic.
#include "values_testlog.h"

#include <cstring>
#include <random>
#include <string>

namespace {

__extension__ typedef unsigned __int128 U128;
const U128 kMask96 = (static_cast<U128>(1) << 96) - 1;

// A number with the given words, sign and scale, through the public binary record.
OEPrecisionInteger Make(U128 mag, int sign = 1, unsigned scale = 0) {
    unsigned char rec[20] = {1, 0};
    for (int i = 0; i < 12; ++i) rec[2 + i] = static_cast<unsigned char>(mag >> (8 * i));
    rec[14] = rec[15] = sign < 0 ? 0xFF : 0;
    if (sign > 0) rec[14] = 1;
    rec[16] = static_cast<unsigned char>(scale);
    rec[17] = static_cast<unsigned char>(scale >> 8);
    OEPrecisionInteger n;
    n.ImportBinary(rec);
    return n;
}

U128 Mag(const OEPrecisionInteger& n) {
    return static_cast<U128>(n.GetLSBytes()) | (static_cast<U128>(n.GetSSBytes()) << 32) |
           (static_cast<U128>(n.GetMSBytes()) << 64);
}

std::string Text(OEPrecisionInteger n) {
    const char* t = n;
    return t ? t : "<null>";
}

U128 Pow10(unsigned n) {
    U128 p = 1;
    while (n--) p *= 10;
    return p;
}

class ValuesPrecision : public ::testing::Test {
protected:
    ScopedWarningLog log;
};

TEST_F(ValuesPrecision, TextConversion) {
    const std::string d28(28, '9'), d29(29, '9');
    const std::string scale30 = "1." + std::string(30, ',');
    struct Case {
        std::string text;
        unsigned short ok;
        int warning; // -1: none
        const char* form;
        int sign;
        unsigned scale;
    } cases[] = {{"", 0, OEPW_BADFORMAT, "0", 1, 0},
                 {"0", 1, -1, "0", 1, 0},
                 {"-0", 1, -1, "-0", -1, 0},
                 {"1,234.50", 1, -1, "1234.5", 1, 2},
                 {"12,34.5", 1, -1, "1234.5", 1, 1},
                 {"+5", 1, -1, "5", 1, 0},
                 {"-.5", 1, -1, "-.5", -1, 1},
                 {"5+", 0, OEPW_BADFORMAT, "5", 1, 0},
                 {"1.2.3", 0, OEPW_BADFORMAT, ".123", 1, 3},
                 {"12.3x", 0, OEPW_BADFORMAT, "1.23", 1, 2},
                 {"1a2b3c", 0, OEPW_BADFORMAT, "123", 1, 0},
                 {d28, 1, -1, d28.c_str(), 1, 0},
                 {"-" + d28, 1, -1, nullptr, -1, 0},
                 {d29, 0, OEPW_TOOLONG, d28.c_str(), 1, 0}, // the 29th digit stops with what was read
                 {".0000000000000000000000000001", 1, -1, ".0000000000000000000000000001", 1, 28},
                 {"0.0000000000000000000000000001", 0, OEPW_TOOLONG, nullptr, 1, 28}, // the leading 0 counts
                 {scale30, 0, OEPW_BADFORMAT, "0", 1, 30}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        OEPrecisionInteger n(static_cast<std::int32_t>(77), 1);
        EXPECT_EQ(c.ok, n.ConvertStringToOEPrecisionInteger(c.text.c_str()));
        if (c.warning < 0)
            EXPECT_TRUE(log.None());
        else
            EXPECT_TRUE(log.ExactlyOne(static_cast<OEParseWarning>(c.warning), c.text, ""));
        EXPECT_EQ(c.sign, n.Sign());
        EXPECT_EQ(c.scale, n.Decimal());
        if (c.form) {
            EXPECT_EQ(c.form, Text(n));
        }
    }
    OEPrecisionInteger n;
    EXPECT_EQ(0, n.ConvertStringToOEPrecisionInteger(nullptr));
    EXPECT_TRUE(log.ExactlyOne(OEPW_NULLPOINTER, ""));
}

TEST_F(ValuesPrecision, TextForm) {
    const U128 max = kMask96;
    struct Case {
        U128 mag;
        int sign;
        unsigned scale;
        const char* form;
    } cases[] = {{5, 1, 3, ".005"},
                 {110, 1, 2, "1.1"},
                 {200, 1, 2, "2"},
                 {0, -1, 2, "-0"},
                 {0, 1, 5, "0"},
                 {150, -1, 2, "-1.5"},
                 {1, 1, 29, ".00000000000000000000000000001"},
                 {7, 1, 30, "0"},
                 {4294967295u, 1, 0, "4294967295"},
                 {4294967296ull, 1, 0, "4294967296"},
                 {4294967296ull, 1, 15, ".000004294967296"},
                 {static_cast<U128>(10000000000000000000ull) * 100, -1, 21, "-1"},
                 {static_cast<U128>(1234567890123456789ull) * 1000 + 500, 1, 5, "12345678901234567.895"},
                 {max, 1, 0, "79228162514264337593543950335"},
                 {max, -1, 29, "-.79228162514264337593543950335"},
                 {max, 1, 1, "7922816251426433759354395033.5"}};
    for (const Case& c : cases) {
        EXPECT_EQ(c.form, Text(Make(c.mag, c.sign, c.scale)));
    }
    // The buffer belongs to the number and is reused; a copy has its own.
    OEPrecisionInteger a("1.5");
    char* first = a;
    OEPrecisionInteger b(a);
    char* other = b;
    EXPECT_NE(first, other);
    a = "2";
    EXPECT_EQ(first, static_cast<char*>(a));
    EXPECT_STREQ("2", first);
}

TEST_F(ValuesPrecision, Arithmetic) {
    struct Case {
        const char* a;
        char op;
        const char* b;
        const char* result;
        int sign;
        unsigned scale;
    } cases[] = {{"1.5", '+', "2.25", "3.75", 1, 2}, {"2", '-', "5", "-3", -1, 0},
                 {"5", '-', "5", "0", 1, 0},         {"-5", '+', "5", "0", 1, 0},
                 {"-0", '+', "-0", "0", 1, 0},       {"-5", '*', "0", "-0", -1, 0},
                 {"10", '/', "4", "2", 1, 0},        {"10.00", '/', "3", "3.33", 1, 2},
                 {"7", '/', "0", "7", 1, 0},         {"7", '/', "-1", "7", 1, 0},
                 {"7", '/', "0.5", "7", 1, 0},       {"-7.5", '/', "-0.99", "-7.5", -1, 1},
                 {"-0.00", '/', "5", "-0", -1, 2}};
    for (const Case& c : cases) {
        SCOPED_TRACE(std::string(c.a) + " " + c.op + " " + c.b);
        OEPrecisionInteger a(c.a), b(c.b), r;
        switch (c.op) {
        case '+':
            r = a + b;
            break;
        case '-':
            r = a - b;
            break;
        case '*':
            r = a * b;
            break;
        default:
            r = a / b;
            break;
        }
        EXPECT_EQ(c.result, Text(r));
        EXPECT_EQ(c.sign, r.Sign());
        EXPECT_EQ(c.scale, r.Decimal());
        if (c.op == '+') {
            a += b;
            EXPECT_EQ(c.result, Text(a));
        } else if (c.op == '-') {
            a -= b;
            EXPECT_EQ(c.result, Text(a));
        }
    }
    // Carries past bit 95 are lost.
    OEPrecisionInteger top = Make(static_cast<U128>(1) << 95);
    EXPECT_TRUE((top + top).IsZero());
    EXPECT_EQ(1, (top + top).Sign());
    // (2^96-1)^2 = 1 modulo 2^96
    EXPECT_TRUE(Make(kMask96 - 1) == Make(kMask96) * Make(kMask96) + Make(kMask96 - 2));
}

TEST_F(ValuesPrecision, Ordering) {
    struct Case {
        const char* a;
        const char* b;
        int cmp; // sign of a - b by the ordering rules
        bool equal;
    } cases[] = {{"1.5", "1.50", 0, true}, {"-0", "0", -1, false},    {"0", "-0", 1, false},
                 {"-0.00", "-0", 0, true}, {"-2", "-1", -1, false},   {"-1.5", "-1.49", -1, false},
                 {"2", "10", -1, false},   {"0.1", "0.09", 1, false}, {"100", "99.999", 1, false},
                 {"-100", "5", -1, false}};
    for (const Case& c : cases) {
        SCOPED_TRACE(std::string(c.a) + " vs " + c.b);
        OEPrecisionInteger a(c.a), b(c.b);
        EXPECT_EQ(c.equal, a == b);
        EXPECT_EQ(!c.equal, a != b);
        EXPECT_EQ(c.cmp > 0, a > b);
        EXPECT_EQ(c.cmp >= 0, a >= b);
        EXPECT_EQ(c.cmp < 0, a < b);
        EXPECT_EQ(c.cmp <= 0, a <= b);
    }
}

TEST_F(ValuesPrecision, RescalingAndParts) {
    OEPrecisionInteger n("-1.99");
    n.Decimal(0);
    EXPECT_EQ("-1", Text(n));
    n = "1.5";
    n.Decimal(3);
    EXPECT_EQ(3, n.Decimal());
    EXPECT_EQ(1500u, n.GetOEULong());
    EXPECT_EQ("1.5", Text(n));
    EXPECT_EQ(0, n.SetDecimal(30));
    EXPECT_EQ(1, n.SetDecimal(29));
    EXPECT_EQ(1500u, n.GetOEULong());

    OEPrecisionInteger m("-12.75");
    EXPECT_EQ("-12", Text(m.Integer()));
    EXPECT_EQ(0, m.Integer().Decimal());
    EXPECT_EQ("-12.75", Text(m.Fraction())); // the whole number, unchanged
    EXPECT_EQ("-127.5", Text(m.Mul10()));
    EXPECT_EQ("-1.27", Text(m.Div10()));
    EXPECT_EQ("12.75", Text(m.abs()));
    m.Mul10InPlace();
    EXPECT_EQ("-127.5", Text(m));
    m.Negate();
    EXPECT_EQ("127.5", Text(m));
    OEPrecisionInteger zero;
    zero.Negate();
    EXPECT_EQ(1, zero.Sign());
    OEPrecisionInteger negZero("-0");
    negZero.Negate();
    EXPECT_EQ(1, negZero.Sign());

    OEPrecisionInteger s(static_cast<std::int32_t>(3), 1);
    s << 4;
    EXPECT_EQ(48u, s.GetOEULong());
    s >>= 3;
    EXPECT_EQ(6u, s.GetOEULong());
    EXPECT_EQ(1, s.Decimal());
    s <<= 95;
    EXPECT_EQ(0u, s.GetMSBytes()); // bit 96 and up are gone
    s = static_cast<std::int32_t>(1);
    s << 95;
    EXPECT_EQ(0x80000000u, s.GetMSBytes());
    s >> 200;
    EXPECT_TRUE(s.IsZero());
}

TEST_F(ValuesPrecision, Accessors) {
    struct Case {
        U128 mag;
        int sign;
        bool s64, u64, s32, u32, s16, u16;
    } cases[] = {{32767, 1, true, true, true, true, true, true},
                 {32768, -1, true, true, true, true, false, true},
                 {65536, 1, true, true, true, true, false, false},
                 {0x80000000u, 1, true, true, false, true, false, false},
                 {0x100000000ull, 1, true, true, false, false, false, false},
                 {0x8000000000000000ull, 1, false, true, false, false, false, false},
                 {static_cast<U128>(1) << 64, 1, false, false, false, false, false, false}};
    for (const Case& c : cases) {
        const OEPrecisionInteger n = Make(c.mag, c.sign, 4);
        EXPECT_EQ(c.s64, n.FitInASInt64() != 0);
        EXPECT_EQ(c.u64, n.FitInAUInt64() != 0);
        EXPECT_EQ(c.s32, n.FitInASLong() != 0);
        EXPECT_EQ(c.u32, n.FitInAULong() != 0);
        EXPECT_EQ(c.s16, n.FitInASShort() != 0);
        EXPECT_EQ(c.u16, n.FitInAUShort() != 0);
    }
    const OEPrecisionInteger n = Make((static_cast<U128>(5) << 64) | 0x0000000700011170ull, -1, 2);
    EXPECT_EQ(0x0000000700011170ull, n.GetOEUINT64());
    EXPECT_EQ(-0x0000000700011170ll, n.GetOEINT64());
    EXPECT_EQ(0x00011170u, n.GetOEULong());
    EXPECT_EQ(-0x00011170, n.GetOESLong());
    EXPECT_EQ(0x1170u, n.GetOEUShort());
    EXPECT_EQ(-0x1170, n.GetOESShort());
    EXPECT_TRUE(n.IsNegative());
    EXPECT_FALSE(n.IsPositive());
    EXPECT_TRUE(OEPrecisionInteger().IsPositive()); // zero is positive
    EXPECT_TRUE(OEPrecisionInteger("-0").IsZero());
    EXPECT_TRUE(OEPrecisionInteger(-9223372036854775807ll - 1, 0).FitInAUInt64());
    EXPECT_EQ("-9223372036854775808", Text(OEPrecisionInteger(-9223372036854775807ll - 1, 0)));
    EXPECT_EQ("-21474836.48", Text(OEPrecisionInteger(static_cast<std::int32_t>(-2147483647 - 1), 2)));
    EXPECT_EQ("18446744073709551615", Text(OEPrecisionInteger(18446744073709551615ull, 0)));
}

TEST_F(ValuesPrecision, Validity) {
    struct Case {
        const char* text;
        bool percent, positive;
    } cases[] = {{"100", true, true},    {"100.00", true, true}, {"100.01", false, true},
                 {"100.5", false, true}, {"0", true, true},      {"-1", false, false},
                 {"-0", false, true},    {"0.001", true, true},  {"55.5", true, true},
                 {"-0.01", false, false}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        EXPECT_EQ(c.percent, OEPercent(c.text).IsValid() != 0);
        EXPECT_EQ(c.positive, OEPosPrecisionInteger(c.text).IsValid() != 0);
        EXPECT_TRUE(OEPrecisionInteger(c.text).IsValid());
    }
    EXPECT_FALSE(Make(1, 1, 30).IsValid());
    OEPercent p;
    p = Make(1, 1, 30);
    EXPECT_FALSE(p.IsValid());
}

TEST_F(ValuesPrecision, BinaryRecord) {
    OEPrecisionInteger n =
        Make((static_cast<U128>(0x0A0B0C0D) << 64) | (0x01020304ull << 32) | 0xF1F2F3F4u, -1, 7);
    unsigned char rec[20];
    std::memset(rec, 0xAA, sizeof rec);
    unsigned long size = 0;
    ASSERT_EQ(1, n.ExportBinary(rec, &size));
    EXPECT_EQ(20u, size);
    EXPECT_EQ(20u, n.BinaryLength());
    const unsigned char expected[20] = {1,    0,    0xF4, 0xF3, 0xF2, 0xF1, 0x04, 0x03, 0x02, 0x01,
                                        0x0D, 0x0C, 0x0B, 0x0A, 0xFF, 0xFF, 7,    0,    0xAA, 0xAA};
    EXPECT_EQ(0, std::memcmp(expected, rec, 20));
    OEPrecisionInteger back;
    ASSERT_EQ(1, back.ImportBinary(rec));
    EXPECT_TRUE(back == n);
    EXPECT_EQ(7, back.Decimal());
    rec[0] = 2; // another version: ignored
    OEPrecisionInteger untouched("42");
    EXPECT_EQ(0, untouched.ImportBinary(rec));
    EXPECT_EQ("42", Text(untouched));

    unsigned char* block = n.LockBuffer();
    ASSERT_NE(nullptr, block);
    EXPECT_EQ(block, n.LockBuffer());
    EXPECT_EQ(1, n.ExportBinary(block, nullptr));
    n.UnLockBuffer();
}

int FailEverything(std::size_t) {
    return 1;
}

TEST_F(ValuesPrecision, TextBufferOutOfMemory) {
    OEPrecisionInteger n("12.5");
    OEMemory::FailureHook previous = OEMemory::SetFailureHook(FailEverything);
    char* text = n;
    OEMemory::SetFailureHook(previous);
    EXPECT_EQ(nullptr, text);
    EXPECT_EQ(OETE_OUTOFMEMORY, OEThreadState::GetErrorCode());
    OEThreadState::SetErrorCode(OETE_NONE);
    EXPECT_EQ("12.5", Text(n));
}

// Random operands within range, compared with exact 128-bit arithmetic.
TEST_F(ValuesPrecision, PropertiesAgainst128BitArithmetic) {
    std::mt19937_64 rng(20240131);
    auto randomMag = [&](unsigned bits) {
        U128 v = (static_cast<U128>(rng()) << 64) | rng();
        return bits >= 128 ? v : v & ((static_cast<U128>(1) << bits) - 1);
    };
    for (int i = 0; i < 4000; ++i) {
        const unsigned sa = rng() % 5, sb = rng() % 5;
        const int siga = rng() & 1 ? -1 : 1, sigb = rng() & 1 ? -1 : 1;
        const U128 a = randomMag(1 + rng() % 80), b = randomMag(1 + rng() % 80);
        const OEPrecisionInteger x = Make(a, siga, sa), y = Make(b, sigb, sb);

        // Addition and subtraction at the larger scale.
        const unsigned s = sa > sb ? sa : sb;
        const U128 ea = a * Pow10(s - sa), eb = b * Pow10(s - sb);
        for (int sub = 0; sub < 2; ++sub) {
            const int sy = sub ? -sigb : sigb;
            __extension__ __int128 exact = static_cast<__int128>(ea) * siga + static_cast<__int128>(eb) * sy;
            const OEPrecisionInteger r = sub ? x - y : x + y;
            ASSERT_EQ(s, r.Decimal());
            ASSERT_TRUE(Mag(r) == static_cast<U128>(exact < 0 ? -exact : exact));
            ASSERT_EQ(exact < 0 ? -1 : 1, r.Sign());
        }

        // Multiplication: scales add, the product wraps modulo 2^96.
        const OEPrecisionInteger p = x * y;
        ASSERT_TRUE(Mag(p) == ((a * b) & kMask96));
        ASSERT_EQ(sa + sb, p.Decimal());
        ASSERT_EQ(siga * sigb, p.Sign());

        // Truncating division of the scaled magnitudes.
        if (b != 1 && b >= Pow10(sb)) {
            const unsigned ds = sa > sb ? sa : sb;
            const OEPrecisionInteger q = x / y;
            ASSERT_TRUE(Mag(q) == a * Pow10(ds - sa) / b);
            ASSERT_EQ(a == 0 ? sa : ds - sb, q.Decimal());
            ASSERT_EQ(a == 0 ? siga : siga * sigb, q.Sign());
        }

        // Rescaling truncates toward zero or multiplies.
        OEPrecisionInteger r = x;
        const unsigned target = rng() % 8;
        r.Decimal(static_cast<unsigned short>(target));
        const U128 expected = target >= sa ? (a * Pow10(target - sa)) & kMask96 : a / Pow10(sa - target);
        ASSERT_TRUE(Mag(r) == expected);

        // Text round trip.
        OEPrecisionInteger text(x);
        const std::string form = Text(text);
        OEPrecisionInteger back(form.c_str());
        ASSERT_TRUE(back == x) << form;
        ASSERT_EQ(form, Text(back));
    }
    // Full-width sums wrap modulo 2^96.
    for (int i = 0; i < 500; ++i) {
        const U128 a = randomMag(96), b = randomMag(96);
        ASSERT_TRUE(Mag(Make(a) + Make(b)) == ((a + b) & kMask96));
        ASSERT_TRUE(Mag(Make(a) * Make(b)) == ((a * b) & kMask96));
    }
    EXPECT_TRUE(log.None());
}

} // namespace
