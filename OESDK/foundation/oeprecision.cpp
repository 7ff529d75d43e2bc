#include "foundation/oeprecision.h"

#include "foundation/oememory.h"
#include "foundation/oeparsewarning.h"

#include <array>
#include <cstring>

namespace {

// The magnitude is handled as one 128-bit unsigned integer inside this file; results are cut
// back to 96 bits, which is exactly the wrap-around of word-by-word arithmetic with lost carries.
__extension__ typedef unsigned __int128 U128;

const U128 kMask96 = (static_cast<U128>(1) << 96) - 1;

inline U128 Pack(std::uint32_t lo, std::uint32_t mid, std::uint32_t hi) {
    return static_cast<U128>(lo) | (static_cast<U128>(mid) << 32) | (static_cast<U128>(hi) << 64);
}

// 10^n for n <= 38 (exact in 128 bits).
U128 Pow10(unsigned n) {
    U128 p = 1;
    while (n--) p *= 10;
    return p;
}

// magnitude x 10^n modulo 2^96 (the result of n times Mul10InPlace).
U128 MulPow10Wrap(U128 mag, unsigned long n) {
    static const U128 k10e19 = Pow10(19);
    while (n >= 19 && mag != 0) {
        mag = (mag * k10e19) & kMask96; // the product wraps mod 2^128, a multiple of 2^96
        n -= 19;
    }
    if (mag != 0 && n) mag = (mag * Pow10(static_cast<unsigned>(n))) & kMask96;
    return mag;
}

// "00" to "99", two characters per number.
const char kPairs[] = "00010203040506070809101112131415161718192021222324252627282930313233343536373839"
                      "40414243444546474849505152535455565758596061626364656667686970717273747576777879"
                      "8081828384858687888990919293949596979899";

// The number of decimal digits of v (1 for 0).
unsigned DigitCount(std::uint64_t v) {
    unsigned n = 1;
    for (; v >= 10000; v /= 10000) n += 4;
    if (v >= 10) ++n;
    if (v >= 100) ++n;
    if (v >= 1000) ++n;
    return n;
}

// Writes the decimal digits of v (no leading zeros, "0" for 0); returns the count.
int Digits64(std::uint64_t v, char* out) {
    char tmp[20];
    char* p = tmp + sizeof(tmp);
    while (v >= 100) {
        p -= 2;
        std::memcpy(p, kPairs + 2 * (v % 100), 2);
        v /= 100;
    }
    if (v >= 10) {
        p -= 2;
        std::memcpy(p, kPairs + 2 * v, 2);
    } else {
        *--p = static_cast<char>('0' + v);
    }
    const int n = static_cast<int>(tmp + sizeof(tmp) - p);
    std::memcpy(out, p, static_cast<std::size_t>(n));
    return n;
}

// The digits of [begin, end), other characters skipped, as one number: the magnitudes too wide
// for 64 bits (at most 28 digits, so below 2^96). Kept out of line to leave the common reading
// lean.
__attribute__((noinline)) U128 WideDigits(const char* begin, const char* end) {
    U128 mag = 0;
    for (const char* p = begin; p < end; ++p) {
        const unsigned d = static_cast<unsigned>(static_cast<unsigned char>(*p)) - '0';
        if (d <= 9) mag = mag * 10 + d;
    }
    return mag;
}

void Warn(OEParseWarning code, const char* text) {
    OELogParseWarning(code, text ? text : "", "");
}

} // namespace

// The 29 powers of ten 10^0 .. 10^28, built once under the runtime's thread-safe static
// initialisation the first time a conversion needs more than 32 bits.
static const std::array<OEPrecisionInteger, 29>& PowerTable() {
    static const std::array<OEPrecisionInteger, 29> table = [] {
        std::array<OEPrecisionInteger, 29> t;
        unsigned long long p = 1;
        for (int i = 0; i < 20; ++i) {
            t[i] = OEPrecisionInteger(p, 0);
            if (i < 19) p *= 10;
        }
        for (int i = 20; i < 29; ++i) t[i] = t[i - 1].Mul10();
        return t;
    }();
    return table;
}

const OEPrecisionInteger OEPrecisionInteger::OEZero;
const OEPrecisionInteger OEPrecisionInteger::OEOneHundred(static_cast<std::int32_t>(100), 0);
const OEPrecisionInteger OEPrecisionInteger::OEPIOctillion("1000000000000000000000000000");
const OEPrecisionInteger OEPrecisionInteger::OEPITenPentillion("10000000000000000000");

#define OE_MAG() Pack(m_lo, m_mid, m_hi)
#define OE_SETMAG(obj, v)                                                                                    \
    do {                                                                                                     \
        U128 v_ = (v);                                                                                       \
        (obj).m_lo = static_cast<std::uint32_t>(v_);                                                         \
        (obj).m_mid = static_cast<std::uint32_t>(v_ >> 32);                                                  \
        (obj).m_hi = static_cast<std::uint32_t>(v_ >> 64);                                                   \
    } while (0)

OEPrecisionInteger::OEPrecisionInteger(std::int32_t value, unsigned short scale) : OEPrecisionInteger() {
    m_lo = value < 0 ? 0u - static_cast<std::uint32_t>(value) : static_cast<std::uint32_t>(value);
    m_sign = value < 0 ? -1 : 1;
    m_scale = scale;
}

OEPrecisionInteger::OEPrecisionInteger(long long value, unsigned short scale) : OEPrecisionInteger() {
    unsigned long long mag =
        value < 0 ? 0ull - static_cast<unsigned long long>(value) : static_cast<unsigned long long>(value);
    m_lo = static_cast<std::uint32_t>(mag);
    m_mid = static_cast<std::uint32_t>(mag >> 32);
    m_sign = value < 0 ? -1 : 1;
    m_scale = scale;
}

OEPrecisionInteger::OEPrecisionInteger(unsigned long long value, unsigned short scale)
    : OEPrecisionInteger() {
    m_lo = static_cast<std::uint32_t>(value);
    m_mid = static_cast<std::uint32_t>(value >> 32);
    m_scale = scale;
}

OEPrecisionInteger::OEPrecisionInteger(const char* text) : OEPrecisionInteger() {
    ConvertStringToOEPrecisionInteger(text);
}

OEPrecisionInteger::OEPrecisionInteger(const OEPrecisionInteger& other)
    : m_lo(other.m_lo), m_mid(other.m_mid), m_hi(other.m_hi), m_sign(other.m_sign), m_scale(other.m_scale),
      m_text(nullptr), m_binary(nullptr), m_binaryLen(0) {}

OEPrecisionInteger::~OEPrecisionInteger() {
    OEMemory::Free(m_text);
    OEMemory::Free(m_binary);
}

OEPrecisionInteger& OEPrecisionInteger::operator=(const char* text) {
    ConvertStringToOEPrecisionInteger(text);
    return *this;
}

OEPrecisionInteger& OEPrecisionInteger::operator=(long long value) {
    OEPrecisionInteger v(value, 0);
    return operator=(v);
}

OEPrecisionInteger& OEPrecisionInteger::operator=(std::int32_t value) {
    OEPrecisionInteger v(value, 0);
    return operator=(v);
}

OEPrecisionInteger& OEPrecisionInteger::operator=(const OEPrecisionInteger& other) {
    m_lo = other.m_lo;
    m_mid = other.m_mid;
    m_hi = other.m_hi;
    m_sign = other.m_sign;
    m_scale = other.m_scale;
    return *this;
}

// The common shape [+|-]digits[.digits], with ',' among the integer digits and at most 28
// digits in all, is read without measuring the text first (in one pass up to 19 digits); it
// cannot fail. Any other text, the empty one included, goes to ParseText, which also says what
// is wrong with it.
unsigned short OEPrecisionInteger::ConvertStringToOEPrecisionInteger(const char* text) {
    if (text) {
        const char* p = text;
        short sign = 1;
        if (*p == '-' || *p == '+') sign = *p++ == '-' ? -1 : 1;
        std::uint64_t mag = 0; // wraps harmlessly past 19 digits: such a text is read again
        unsigned digits = 0;
        for (;; ++p) {
            const unsigned d = static_cast<unsigned>(static_cast<unsigned char>(*p)) - '0';
            if (d <= 9) {
                mag = mag * 10 + d;
                ++digits;
            } else if (*p != ',') {
                break;
            }
        }
        unsigned scale = 0;
        if (*p == '.') {
            for (++p;; ++p) {
                const unsigned d = static_cast<unsigned>(static_cast<unsigned char>(*p)) - '0';
                if (d > 9) break;
                mag = mag * 10 + d;
                ++scale;
            }
        }
        digits += scale;
        if (*p == 0 && digits != 0 && digits < kMaxDigits) {
            m_sign = sign;
            m_scale = static_cast<unsigned short>(scale);
            if (digits > 19) {
                OE_SETMAG(*this, WideDigits(text, p));
                return 1;
            }
            m_lo = static_cast<std::uint32_t>(mag);
            m_mid = static_cast<std::uint32_t>(mag >> 32);
            m_hi = 0;
            return 1;
        }
    }
    if (!text) {
        m_lo = m_mid = m_hi = 0;
        m_sign = 1;
        m_scale = 0;
        Warn(OEPW_NULLPOINTER, nullptr);
        return 0;
    }
    return ParseText(text, text + std::strlen(text), text);
}

unsigned short OEPrecisionInteger::ParseText(const char* begin, const char* end, const char* report) {
    m_lo = m_mid = m_hi = 0;
    m_sign = 1;
    m_scale = 0;
    bool error = false;
    bool pointSeen = false;
    unsigned digits = 0;
    short sign = 1;
    std::size_t scale = 0;
    U128 mag = 0; // at most 28 digits are accumulated, always below 2^96
    auto fail = [&](OEParseWarning code) {
        if (!error) Warn(code, report);
        error = true;
    };
    for (const char* p = begin; p < end; ++p) {
        const char c = *p;
        if (c >= '0' && c <= '9') {
            if (++digits >= kMaxDigits) {
                fail(OEPW_TOOLONG);
                break;
            }
            mag = mag * 10 + static_cast<unsigned>(c - '0');
        } else if (c == ',') {
            continue; // grouping separator, wherever it stands
        } else if (c == '.') {
            if (pointSeen) {
                fail(OEPW_BADFORMAT);
            } else {
                pointSeen = true;
                scale = static_cast<std::size_t>(end - p - 1); // every character after the point
            }
        } else if (c == '+' && p == begin) {
            continue;
        } else if (c == '-' && p == begin) {
            sign = -1;
        } else {
            fail(OEPW_BADFORMAT);
        }
    }
    OE_SETMAG(*this, mag);
    m_sign = sign;
    m_scale = static_cast<unsigned short>(scale > 65535 ? 65535 : scale);
    if (begin == end || scale >= 30) fail(OEPW_BADFORMAT);
    return error ? 0 : 1;
}

void OEPrecisionInteger::RightAlign(OEPrecisionInteger& a, OEPrecisionInteger& b) {
    if (a.m_scale < b.m_scale) {
        OE_SETMAG(a, MulPow10Wrap(Pack(a.m_lo, a.m_mid, a.m_hi), b.m_scale - a.m_scale));
        a.m_scale = b.m_scale;
    } else if (b.m_scale < a.m_scale) {
        OE_SETMAG(b, MulPow10Wrap(Pack(b.m_lo, b.m_mid, b.m_hi), a.m_scale - b.m_scale));
        b.m_scale = a.m_scale;
    }
}

unsigned short OEPrecisionInteger::operator==(const OEPrecisionInteger& other) const {
    if (m_sign != other.m_sign) return 0;
    if (m_scale == other.m_scale)
        return m_lo == other.m_lo && m_mid == other.m_mid && m_hi == other.m_hi ? 1 : 0;
    OEPrecisionInteger a(*this), b(other);
    RightAlign(a, b);
    return a.m_lo == b.m_lo && a.m_mid == b.m_mid && a.m_hi == b.m_hi ? 1 : 0;
}

unsigned short OEPrecisionInteger::operator!=(const OEPrecisionInteger& other) const {
    return operator==(other) ? 0 : 1;
}

// -1, 0 or 1 as *this is below, equal to or above other, by the ordering rules (a positive sign
// beats a negative one even between zeros).
static int CompareNumbers(const OEPrecisionInteger& x, const OEPrecisionInteger& y, U128 xm, U128 ym,
                          unsigned short xs, unsigned short ys) {
    if (x.Sign() != y.Sign()) return x.Sign() > 0 ? 1 : -1;
    if (xs < ys) xm = MulPow10Wrap(xm, ys - xs);
    if (ys < xs) ym = MulPow10Wrap(ym, xs - ys);
    int r = xm > ym ? 1 : (xm < ym ? -1 : 0);
    return x.Sign() < 0 ? -r : r;
}

unsigned short OEPrecisionInteger::operator>(const OEPrecisionInteger& other) const {
    return CompareNumbers(*this, other, OE_MAG(), Pack(other.m_lo, other.m_mid, other.m_hi), m_scale,
                          other.m_scale) > 0;
}
unsigned short OEPrecisionInteger::operator>=(const OEPrecisionInteger& other) const {
    return CompareNumbers(*this, other, OE_MAG(), Pack(other.m_lo, other.m_mid, other.m_hi), m_scale,
                          other.m_scale) >= 0;
}
unsigned short OEPrecisionInteger::operator<(const OEPrecisionInteger& other) const {
    return other > *this;
}
unsigned short OEPrecisionInteger::operator<=(const OEPrecisionInteger& other) const {
    return other >= *this;
}

OEPrecisionInteger& OEPrecisionInteger::operator<<(unsigned short bits) {
    OE_SETMAG(*this, bits >= 96 ? 0 : (OE_MAG() << bits) & kMask96);
    return *this;
}
OEPrecisionInteger& OEPrecisionInteger::operator>>(unsigned short bits) {
    OE_SETMAG(*this, bits >= 96 ? 0 : OE_MAG() >> bits);
    return *this;
}
OEPrecisionInteger& OEPrecisionInteger::operator<<=(unsigned short bits) {
    return operator<<(bits);
}
OEPrecisionInteger& OEPrecisionInteger::operator>>=(unsigned short bits) {
    return operator>>(bits);
}

OEPrecisionInteger& OEPrecisionInteger::operator+=(const OEPrecisionInteger& other) {
    U128 a = OE_MAG();
    U128 b = Pack(other.m_lo, other.m_mid, other.m_hi);
    unsigned short scale = m_scale;
    if (m_scale < other.m_scale) {
        a = MulPow10Wrap(a, other.m_scale - m_scale);
        scale = other.m_scale;
    } else if (other.m_scale < m_scale) {
        b = MulPow10Wrap(b, m_scale - other.m_scale);
    }
    U128 r;
    short sign = m_sign;
    if (m_sign == other.m_sign) {
        r = (a + b) & kMask96;
    } else if (a >= b) {
        r = a - b;
    } else {
        r = b - a;
        sign = other.m_sign;
    }
    OE_SETMAG(*this, r);
    m_scale = scale;
    m_sign = r == 0 ? 1 : sign;
    return *this;
}

OEPrecisionInteger& OEPrecisionInteger::operator-=(const OEPrecisionInteger& other) {
    OEPrecisionInteger negated(other);
    negated.OEPrecisionInteger::Negate();
    return operator+=(negated);
}

OEPrecisionInteger OEPrecisionInteger::operator+(const OEPrecisionInteger& other) const {
    OEPrecisionInteger r(*this);
    r.OEPrecisionInteger::operator+=(other);
    return r;
}

OEPrecisionInteger OEPrecisionInteger::operator-(const OEPrecisionInteger& other) const {
    OEPrecisionInteger r(*this);
    r.OEPrecisionInteger::operator-=(other);
    return r;
}

OEPrecisionInteger OEPrecisionInteger::operator*(const OEPrecisionInteger& other) const {
    // Shift-and-add over the right operand's bits, modulo 2^96, equals the plain product cut to
    // 96 bits; the 128-bit product wraps modulo 2^128, a multiple of 2^96, so the cut is exact.
    OEPrecisionInteger r;
    const U128 b = Pack(other.m_lo, other.m_mid, other.m_hi);
    U128 m;
    if (b == 0)
        m = 0;
    else if (b == 1)
        m = OE_MAG();
    else
        m = (OE_MAG() * b) & kMask96;
    OE_SETMAG(r, m);
    r.m_scale = static_cast<unsigned short>(m_scale + other.m_scale);
    r.m_sign = (m_sign < 0) != (other.m_sign < 0) ? -1 : 1;
    return r;
}

OEPrecisionInteger OEPrecisionInteger::operator/(const OEPrecisionInteger& other) const {
    const U128 b = Pack(other.m_lo, other.m_mid, other.m_hi);
    // A divisor below 1 in absolute value (10^29 exceeds every 96-bit magnitude), or a raw
    // magnitude of 1, returns the dividend unchanged.
    const bool belowOne = other.m_scale >= kMaxDigits || b < Pow10(other.m_scale);
    if (belowOne || b == 1) return OEPrecisionInteger(*this);
    OEPrecisionInteger r;
    r.m_sign = m_sign;
    r.m_scale = m_scale;
    U128 a = OE_MAG();
    if (a == 0) return r;
    unsigned short scale = m_scale;
    if (scale < other.m_scale) {
        a = MulPow10Wrap(a, other.m_scale - scale);
        scale = other.m_scale;
    }
    U128 q;
    if (a <= 0xFFFFFFFFu && b <= 0xFFFFFFFFu && scale == other.m_scale)
        q = static_cast<std::uint32_t>(a) / static_cast<std::uint32_t>(b);
    else
        q = a / b;
    OE_SETMAG(r, q);
    r.m_scale = static_cast<unsigned short>(scale - other.m_scale);
    r.m_sign = (m_sign < 0) != (other.m_sign < 0) ? -1 : 1;
    return r;
}

OEPrecisionInteger OEPrecisionInteger::Mul10() const {
    OEPrecisionInteger r(*this);
    r.OEPrecisionInteger::Mul10InPlace();
    return r;
}

void OEPrecisionInteger::Mul10InPlace() {
    OE_SETMAG(*this, (OE_MAG() * 10) & kMask96);
}

OEPrecisionInteger OEPrecisionInteger::Div10() const {
    OEPrecisionInteger r(*this);
    OE_SETMAG(r, OE_MAG() / 10);
    return r;
}

OEPrecisionInteger OEPrecisionInteger::abs() const {
    OEPrecisionInteger r(*this);
    r.m_sign = 1;
    return r;
}

void OEPrecisionInteger::Negate() {
    if (m_sign < 0)
        m_sign = 1;
    else if (!(m_lo == 0 && m_mid == 0 && m_hi == 0))
        m_sign = -1;
}

OEPrecisionInteger OEPrecisionInteger::Integer() const {
    OEPrecisionInteger r(*this);
    U128 m = OE_MAG();
    for (unsigned s = m_scale; s > 0 && m != 0; --s) m /= 10;
    OE_SETMAG(r, m);
    r.m_scale = 0;
    return r;
}

// Kept as it has always behaved: the whole number, unchanged.
OEPrecisionInteger OEPrecisionInteger::Fraction() const {
    return OEPrecisionInteger(*this);
}

char* OEPrecisionInteger::TextBuffer() {
    if (!m_text) m_text = static_cast<char*>(OEMemory::Malloc(kTextSize));
    return m_text;
}

OEPrecisionInteger::operator char*() {
    char* buf = TextBuffer();
    if (!buf) return nullptr;
    FormatText(buf);
    return buf;
}

unsigned short OEPrecisionInteger::FormatText(char* out) const {
    char* p = out;
    if (m_scale > 29) {
        *p++ = '0';
        *p = '\0';
        return 1;
    }
    if (m_sign == -1) *p++ = '-';
    if (m_hi == 0 && m_mid == 0 && m_lo == 0) {
        *p++ = '0';
        *p = '\0';
        return static_cast<unsigned short>(p - out);
    }
    if (m_hi == 0) {
        // Up to 64 bits: trailing zeros of the fraction dropped first (the text never ends in
        // a zero after the point, nor in the point), then the digits written from the right.
        std::uint64_t v = (static_cast<std::uint64_t>(m_mid) << 32) | m_lo;
        unsigned scale = m_scale;
        while (scale > 0 && v % 10 == 0) {
            v /= 10;
            --scale;
        }
        const unsigned n = DigitCount(v);
        // ".005" has no integer part: the fraction's missing leading digits are zeros.
        const unsigned length = (n > scale ? n : scale) + (scale ? 1 : 0);
        char* q = p + length;
        *q = '\0';
        for (unsigned i = 0; i < scale; ++i, v /= 10) *--q = static_cast<char>('0' + v % 10);
        if (scale) *--q = '.';
        while (v >= 10) {
            q -= 2;
            std::memcpy(q, kPairs + 2 * (v % 100), 2);
            v /= 100;
        }
        if (v) *--q = static_cast<char>('0' + v);
        return static_cast<unsigned short>(p + length - out);
    }
    char digits[kMaxDigits + 1];
    int n;
    if (m_hi == 0 && m_mid == 0) {
        n = Digits64(m_lo, digits);
    } else {
        // Above 64 bits: the digits below 10^19 are the remainder, written with leading zeros.
        static const U128 k10e19 = Pow10(19);
        const U128 m = OE_MAG();
        if (m < (static_cast<U128>(1) << 64)) {
            n = Digits64(static_cast<std::uint64_t>(m), digits);
        } else {
            n = Digits64(static_cast<std::uint64_t>(m / k10e19), digits);
            std::uint64_t low = static_cast<std::uint64_t>(m % k10e19);
            for (int i = n + 18; i >= n; --i, low /= 10) digits[i] = static_cast<char>('0' + low % 10);
            n += 19;
        }
    }
    const int scale = m_scale;
    if (n > scale) {
        std::memcpy(p, digits, static_cast<std::size_t>(n - scale));
        p += n - scale;
        if (scale > 0) {
            *p++ = '.';
            std::memcpy(p, digits + n - scale, static_cast<std::size_t>(scale));
            p += scale;
        }
    } else {
        *p++ = '.';
        for (int i = n; i < scale; ++i) *p++ = '0';
        std::memcpy(p, digits, static_cast<std::size_t>(n));
        p += n;
    }
    if (scale != 0) {
        while (p > out && p[-1] == '0') --p;
        if (p > out && p[-1] == '.') --p;
    }
    *p = '\0';
    return static_cast<unsigned short>(p - out);
}

void OEPrecisionInteger::Decimal(unsigned short scale) {
    U128 m = OE_MAG();
    if (m_scale < scale) {
        m = MulPow10Wrap(m, scale - m_scale);
    } else {
        for (unsigned s = m_scale; s > scale; --s) m /= 10; // truncation, never rounding
    }
    OE_SETMAG(*this, m);
    m_scale = scale;
}

unsigned short OEPrecisionInteger::Decimal() const {
    return m_scale;
}

unsigned short OEPrecisionInteger::FitInASInt64() const {
    return m_hi == 0 && !(m_mid & 0x80000000u);
}
unsigned short OEPrecisionInteger::FitInAUInt64() const {
    return m_hi == 0;
}
unsigned short OEPrecisionInteger::FitInASLong() const {
    return m_hi == 0 && m_mid == 0 && !(m_lo & 0x80000000u);
}
unsigned short OEPrecisionInteger::FitInAULong() const {
    return m_hi == 0 && m_mid == 0;
}
unsigned short OEPrecisionInteger::FitInASShort() const {
    return m_hi == 0 && m_mid == 0 && m_lo < 32768u;
}
unsigned short OEPrecisionInteger::FitInAUShort() const {
    return m_hi == 0 && m_mid == 0 && m_lo < 65536u;
}

short OEPrecisionInteger::Sign() const {
    return m_sign;
}
unsigned short OEPrecisionInteger::IsZero() const {
    return m_lo == 0 && m_mid == 0 && m_hi == 0;
}
unsigned short OEPrecisionInteger::IsPositive() const {
    return m_sign == 1;
}
unsigned short OEPrecisionInteger::IsNegative() const {
    return m_sign == -1;
}
unsigned short OEPrecisionInteger::IsValid() const {
    return m_scale < 30;
}

unsigned long long OEPrecisionInteger::GetOEUINT64() const {
    return static_cast<unsigned long long>(m_lo) | (static_cast<unsigned long long>(m_mid) << 32);
}
long long OEPrecisionInteger::GetOEINT64() const {
    const unsigned long long u = GetOEUINT64();
    return static_cast<long long>(m_sign < 0 ? 0ull - u : u);
}
std::uint32_t OEPrecisionInteger::GetOEULong() const {
    return m_lo;
}
std::int32_t OEPrecisionInteger::GetOESLong() const {
    return static_cast<std::int32_t>(m_sign < 0 ? 0u - m_lo : m_lo);
}
std::uint16_t OEPrecisionInteger::GetOEUShort() const {
    return static_cast<std::uint16_t>(m_lo);
}
std::int16_t OEPrecisionInteger::GetOESShort() const {
    const std::uint16_t u = static_cast<std::uint16_t>(m_lo);
    return static_cast<std::int16_t>(m_sign < 0 ? static_cast<std::uint16_t>(0u - u) : u);
}
std::uint32_t OEPrecisionInteger::GetLSBytes() const {
    return m_lo;
}
std::uint32_t OEPrecisionInteger::GetSSBytes() const {
    return m_mid;
}
std::uint32_t OEPrecisionInteger::GetMSBytes() const {
    return m_hi;
}

unsigned short OEPrecisionInteger::SetDecimal(unsigned short scale) {
    if (scale > 29) return 0;
    m_scale = scale;
    return 1;
}

unsigned short OEPrecisionInteger::Bit(unsigned short n) const {
    return n < 96 && ((OE_MAG() >> n) & 1) ? 1 : 0;
}

unsigned short OEPrecisionInteger::MSD() const {
    const std::array<OEPrecisionInteger, 29>& table = PowerTable();
    const U128 m = OE_MAG();
    unsigned short n = 1;
    while (n < kMaxDigits && m >= Pack(table[n].m_lo, table[n].m_mid, table[n].m_hi)) ++n;
    return n;
}

static void Put16(unsigned char* p, unsigned v) {
    p[0] = static_cast<unsigned char>(v);
    p[1] = static_cast<unsigned char>(v >> 8);
}
static void Put32(unsigned char* p, std::uint32_t v) {
    for (int i = 0; i < 4; ++i) p[i] = static_cast<unsigned char>(v >> (8 * i));
}
static unsigned Get16(const unsigned char* p) {
    return p[0] | (static_cast<unsigned>(p[1]) << 8);
}
static std::uint32_t Get32(const unsigned char* p) {
    std::uint32_t v = 0;
    for (int i = 3; i >= 0; --i) v = (v << 8) | p[i];
    return v;
}

unsigned short OEPrecisionInteger::ExportBinary(unsigned char* block, unsigned long* size) {
    if (!block) return 0;
    Put16(block, kBinaryVersion);
    Put32(block + 2, m_lo);
    Put32(block + 6, m_mid);
    Put32(block + 10, m_hi);
    Put16(block + 14, m_sign < 0 ? 0xFFFFu : 1u);
    Put16(block + 16, m_scale);
    m_binaryLen = kBinaryRecordSize;
    if (size) *size = kBinaryRecordSize;
    return 1;
}

unsigned short OEPrecisionInteger::ImportBinary(const unsigned char* block) {
    if (!block || Get16(block) != kBinaryVersion) return 0;
    m_lo = Get32(block + 2);
    m_mid = Get32(block + 6);
    m_hi = Get32(block + 10);
    m_sign = Get16(block + 14) == 0xFFFFu ? -1 : 1;
    m_scale = static_cast<unsigned short>(Get16(block + 16));
    return 1;
}

unsigned char* OEPrecisionInteger::LockBuffer() {
    if (!m_binary) m_binary = static_cast<unsigned char*>(OEMemory::Calloc(kBinaryRecordSize));
    return m_binary;
}

void OEPrecisionInteger::UnLockBuffer() {
    OEMemory::Free(m_binary);
    m_binary = nullptr;
}

unsigned short OEPercent::IsValid() const {
    return m_scale < 30 && *this >= OEZero && *this <= OEOneHundred;
}

unsigned short OEPosPrecisionInteger::IsValid() const {
    return m_scale < 30 && (m_sign == 1 || IsZero());
}
