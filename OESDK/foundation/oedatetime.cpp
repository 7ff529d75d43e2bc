#include "foundation/oedatetime.h"

#include "foundation/oememory.h"
#include "foundation/oeparsewarning.h"
#include "platform/oeplatform.h"

#include <cstring>

namespace {

const char kCtxDateTime[] = "ConvertStringToOEDateTime";
const char kCtxTime[] = "ConvertStringToOETime";
const char kCtxZone[] = "ExtractTimeZone";
// The closing parenthesis is absent from this context text, as it always has been.
const char kCtxMismatch[] = "SetTimeZone (time zone mismatch";

const char kEmptyMarker[] = "^@~*";
const char kEmptyMarkerLong[] = "__OFX_EMPTY_STRING__";

const long long kSecondsPerDay = 86400;
const long long kFourYears = 126230400; // 1461 days
// The runtime's 64-bit conversions stop at the end of the year 3000; assignment from seconds
// refuses what they would refuse, and whatever lands before the year 1.
const long long kMaxSeconds = 32535215999LL;
const long long kMinSeconds = -62200000000LL; // a little before the year 1 (checked exactly later)

const unsigned short kDaysPerMonth[12] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};

// Days from 1970-01-01 of a proleptic Gregorian date (any field values; no undefined behaviour).
long long DaysFromCivil(long long y, long long m, long long d) {
    y -= m <= 2;
    const long long era = (y >= 0 ? y : y - 399) / 400;
    const long long yoe = y - era * 400;
    const long long doy = (153 * (m > 2 ? m - 3 : m + 9) + 2) / 5 + d - 1;
    const long long doe = yoe * 365 + yoe / 4 - yoe / 100 + doy;
    return era * 146097 + doe - 719468;
}

void CivilFromDays(long long z, long long& y, unsigned& m, unsigned& d) {
    z += 719468;
    const long long era = (z >= 0 ? z : z - 146096) / 146097;
    const long long doe = z - era * 146097;
    const long long yoe = (doe - doe / 1460 + doe / 36524 - doe / 146096) / 365;
    y = yoe + era * 400;
    const long long doy = doe - (365 * yoe + yoe / 4 - yoe / 100);
    const long long mp = (5 * doy + 2) / 153;
    d = static_cast<unsigned>(doy - (153 * mp + 2) / 5 + 1);
    m = static_cast<unsigned>(mp < 10 ? mp + 3 : mp - 9);
    y += m <= 2;
}

long long FloorDiv(long long a, long long b) {
    return a / b - ((a % b != 0) && ((a < 0) != (b < 0)));
}

inline bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

// Reads n decimal digits; false at a non-digit.
bool ReadDigits(const char* p, int n, unsigned short& out) {
    unsigned v = 0;
    for (int i = 0; i < n; ++i) {
        if (!IsDigit(p[i])) return false;
        v = v * 10 + static_cast<unsigned>(p[i] - '0');
    }
    out = static_cast<unsigned short>(v);
    return true;
}

// "00" to "99", two characters per number.
const char kPairs[] = "00010203040506070809101112131415161718192021222324252627282930313233343536373839"
                      "40414243444546474849505152535455565758596061626364656667686970717273747576777879"
                      "8081828384858687888990919293949596979899";

// The last two decimal digits of v.
inline char* Put2(char* p, unsigned v) {
    std::memcpy(p, kPairs + 2 * (v % 100), 2);
    return p + 2;
}

// Unsigned decimal with at least `width` digits.
char* PutUnsigned(char* p, unsigned v, int width) {
    char tmp[12];
    int n = 0;
    do {
        tmp[n++] = static_cast<char>('0' + v % 10);
        v /= 10;
    } while (v);
    while (n < width) tmp[n++] = '0';
    while (n) *p++ = tmp[--n];
    return p;
}

char* PutSigned(char* p, int v) {
    if (v < 0) {
        *p++ = '-';
        return PutUnsigned(p, 0u - static_cast<unsigned>(v), 1);
    }
    return PutUnsigned(p, static_cast<unsigned>(v), 1);
}

// "%02d": at least two characters, the sign included (5 is 05, -5 is -5, -50 is -50).
char* PutSigned2(char* p, int v) {
    return v < 0 ? PutSigned(p, v) : PutUnsigned(p, static_cast<unsigned>(v), 2);
}

// The zone name, at most its three letters: SetTimeZone stores a longer name as given, and the
// text forms have room for three.
char* PutName(char* p, const OEString3& name) {
    const char* s = name.c_str();
    for (int i = 0; i < 3 && s[i]; ++i) *p++ = s[i];
    return p;
}

void Warn(OEParseWarning code, const char* value, const char* context) {
    OELogParseWarning(code, value ? value : "", context);
}

// True when a North American zone name does not belong to its offset of -4 to -8 whole hours.
bool ZoneNameMismatch(const char* name, short hours, short fraction) {
    if (hours > -4 || hours < -8 || fraction != 0 || !*name) return false;
    static const char kStandard[5][4] = {"AST", "EST", "CST", "MST", "PST"};
    static const char kDaylight[5][4] = {"EDT", "CDT", "MDT", "PDT", "YDT"};
    // Character by character: a shorter name stops at its NUL, which no table name has.
    const auto is = [name](const char* k) {
        return name[0] == k[0] && name[1] == k[1] && name[2] == k[2] && name[3] == 0;
    };
    const int i = -hours - 4;
    return !is(kStandard[i]) && !is(kDaylight[i]);
}

} // namespace

OEDateTimeBase::OEDateTimeBase(short year, short month, short day, short hour, short minute, short second,
                               short millisecond, short tzHours, short tzFraction)
    : m_year(static_cast<unsigned short>(year)), m_month(static_cast<unsigned short>(month)),
      m_day(static_cast<unsigned short>(day)), m_hour(static_cast<unsigned short>(hour)),
      m_minute(static_cast<unsigned short>(minute)), m_second(static_cast<unsigned short>(second)),
      m_millisecond(static_cast<unsigned short>(millisecond)), m_tzHours(tzHours), m_tzFraction(tzFraction),
      m_binary(nullptr) {}

OEDateTimeBase::OEDateTimeBase(const OEDateTimeBase& other)
    : m_year(other.m_year), m_month(other.m_month), m_day(other.m_day), m_hour(other.m_hour),
      m_minute(other.m_minute), m_second(other.m_second), m_millisecond(other.m_millisecond),
      m_tzHours(other.m_tzHours), m_tzFraction(other.m_tzFraction), m_tzName(other.m_tzName),
      m_binary(nullptr) {}

OEDateTimeBase::~OEDateTimeBase() {
    OEMemory::Free(m_binary);
}

OEDateTimeBase& OEDateTimeBase::operator=(const OEDateTimeBase& other) {
    if (this == &other) return *this;
    m_year = other.m_year;
    m_month = other.m_month;
    m_day = other.m_day;
    m_hour = other.m_hour;
    m_minute = other.m_minute;
    m_second = other.m_second;
    m_millisecond = other.m_millisecond;
    m_tzHours = other.m_tzHours;
    m_tzFraction = other.m_tzFraction;
    m_tzName = other.m_tzName;
    return *this;
}

OEDateTimeBase& OEDateTimeBase::operator=(const char* text) {
    ConvertStringToOEDateTime(text);
    return *this;
}

unsigned short OEDateTimeBase::IsLeapYear(unsigned short year) {
    return (year % 4 == 0 && (year % 100 != 0 || year % 400 == 0)) ? 1 : 0;
}

unsigned short OEDateTimeBase::DaysInMonth(unsigned short month, unsigned short year) {
    if (month < 1 || month > 12) return 0;
    return static_cast<unsigned short>(kDaysPerMonth[month - 1] + (month == 2 && IsLeapYear(year) ? 1 : 0));
}

unsigned short OEDateTimeBase::IsValidDate() const {
    return m_month >= 1 && m_month <= 12 && m_day >= 1 && m_day <= DaysInMonth(m_month, m_year) ? 1 : 0;
}

unsigned short OEDateTimeBase::IsValidTime() const {
    // No lower bound on the fraction: negative offsets such as -3.5 hours carry a negative one.
    return m_hour <= 23 && m_minute <= 59 && m_second <= 59 && m_millisecond <= 999 && m_tzHours >= -12 &&
                   m_tzHours <= 12 && m_tzFraction <= 99
               ? 1
               : 0;
}

unsigned short OEDateTimeBase::SetDay(unsigned short dayOfYear, unsigned short year) {
    const unsigned short daysInYear = IsLeapYear(year) ? 366 : 365;
    if (dayOfYear == 0 || dayOfYear > daysInYear) return 0;
    unsigned short month = 1;
    unsigned short left = dayOfYear;
    while (left > DaysInMonth(month, year))
        left = static_cast<unsigned short>(left - DaysInMonth(month++, year));
    m_year = year;
    m_month = month;
    m_day = left;
    return 1;
}

unsigned short OEDateTimeBase::SetTimeZone(const char* name, short hours, short fraction) {
    if (StoreTimeZone(name, hours, fraction)) Warn(OEPW_BADFORMAT, name, kCtxMismatch);
    return 1;
}

bool OEDateTimeBase::StoreTimeZone(const char* name, short hours, short fraction) {
    m_tzName.Assign(name, static_cast<unsigned short>(name ? std::strlen(name) : 0));
    m_tzHours = hours;
    m_tzFraction = fraction;
    return ZoneNameMismatch(m_tzName.c_str(), hours, fraction);
}

void OEDateTimeBase::LogPending(unsigned pending, const char* whole) {
    if (pending & kZoneIrregular) Warn(OEPW_BADFORMAT, whole, kCtxZone);
    if (pending & kZoneNameMismatch) Warn(OEPW_BADFORMAT, whole, kCtxMismatch);
}

unsigned short OEDateTimeBase::ExtractTimeZone(const char* zone, const char* whole, unsigned& pending) {
    const char* p = zone + 1; // past '['
    short sign = 1;
    bool signSeen = false, pointSeen = false, closed = false, nameTooLong = false;
    int hourDigits = 0, fracDigits = 0;
    int hours = 0, frac = 0;
    char name[4] = {0, 0, 0, 0};
    int nameLen = 0;
    auto fail = [&]() {
        Warn(OEPW_BADFORMAT, whole, kCtxZone);
        return static_cast<unsigned short>(0);
    };
    for (; *p; ++p) {
        const char c = *p;
        if (c == ']') {
            closed = true;
            ++p;
            break;
        }
        if (c == ':') {
            if (p == zone + 1) return fail();
            for (++p; *p && *p != ']'; ++p) {
                if (nameLen < 3)
                    name[nameLen++] = *p;
                else
                    nameTooLong = true;
            }
            if (*p == ']') {
                closed = true;
                ++p;
            }
            break;
        }
        if (c == '+' || c == '-') {
            if (signSeen || hourDigits > 0 || pointSeen) return fail();
            signSeen = true;
            sign = c == '-' ? -1 : 1;
        } else if (IsDigit(c)) {
            if (pointSeen) {
                if (fracDigits == 2) return fail();
                frac = frac * 10 + (c - '0');
                ++fracDigits;
            } else {
                if (hours < 1000) hours = hours * 10 + (c - '0'); // far out of range stays out of range
                ++hourDigits;
            }
        } else if (c == '.') {
            if (pointSeen) return fail();
            pointSeen = true;
        } else {
            return fail();
        }
    }
    if (closed && *p) return fail(); // text after the closing bracket
    // Irregular but readable: noted once, and the parse goes on with what was read.
    if (!closed || nameTooLong || p == zone + 2) pending |= kZoneIrregular;
    if (fracDigits == 1) frac *= 10; // one digit counts as tenths of an hour
    if (StoreTimeZone(name, static_cast<short>(sign * hours), static_cast<short>(sign * frac)))
        pending |= kZoneNameMismatch;
    if (nameLen && m_tzName.IsEmpty()) { // no memory for the name
        Warn(OEPW_NULLPOINTER, whole, kCtxTime);
        return 0;
    }
    return 1;
}

// --- The common shapes, in one pass ------------------------------------------------------
//
// YYYYMMDD, then HH, HHMM or HHMMSS, then .X to .XXX after HHMMSS, then an optional zone
// [[+|-]H[H][.F[F]][:NNN]] that closes the text. A text is taken here only when it has one of
// these shapes and every field is in range; nothing is stored before that is known, and every
// other text goes to the general reader, which says what is wrong with it.

namespace {

// The digit's value, or more than 9 for any other character.
inline unsigned DigitValue(char c) {
    return static_cast<unsigned>(static_cast<unsigned char>(c)) - static_cast<unsigned>('0');
}

// The two digits at p, or 100 when either is not a digit. The second character is read only
// after a digit, so the end of the text is never passed.
inline unsigned TwoDigits(const char* p) {
    const unsigned tens = DigitValue(p[0]);
    if (tens > 9) return 100;
    const unsigned units = DigitValue(p[1]);
    return units > 9 ? 100 : tens * 10 + units;
}

} // namespace

struct OEDateTimeBase::CommonShape {
    unsigned short year = 0, month = 0, day = 0;
    unsigned short hour = 0, minute = 0, second = 0, millisecond = 0;
    short tzHours = 0, tzFraction = 0;
    char name[4] = {0, 0, 0, 0};
    unsigned short nameLength = 0;
    bool zone = false;

    // YYYYMMDD, a valid date.
    bool ReadDate(const char* p) {
        const unsigned century = TwoDigits(p);
        if (century > 99) return false;
        const unsigned yy = TwoDigits(p + 2);
        if (yy > 99) return false;
        const unsigned mm = TwoDigits(p + 4);
        if (mm < 1 || mm > 12) return false;
        const unsigned dd = TwoDigits(p + 6);
        year = static_cast<unsigned short>(century * 100 + yy);
        month = static_cast<unsigned short>(mm);
        day = static_cast<unsigned short>(dd);
        if (dd >= 1 && dd <= 28) return true;
        const bool leap = year % 4 == 0 && (year % 100 != 0 || year % 400 == 0);
        return dd >= 1 && dd <= kDaysPerMonth[mm - 1] + (mm == 2 && leap ? 1u : 0u);
    }

    // The time and the zone, up to the end of the text.
    bool ReadTime(const char* p) {
        if (DigitValue(*p) <= 9) {
            const unsigned hh = TwoDigits(p);
            if (hh > 23) return false;
            hour = static_cast<unsigned short>(hh);
            p += 2;
            if (DigitValue(*p) <= 9) {
                const unsigned mi = TwoDigits(p);
                if (mi > 59) return false;
                minute = static_cast<unsigned short>(mi);
                p += 2;
                if (DigitValue(*p) <= 9) {
                    const unsigned ss = TwoDigits(p);
                    if (ss > 59) return false;
                    second = static_cast<unsigned short>(ss);
                    p += 2;
                    if (*p == '.') {
                        // One to three digits of milliseconds.
                        unsigned ms = DigitValue(*++p);
                        if (ms > 9) return false;
                        ++p;
                        for (int more = 0; more < 2 && DigitValue(*p) <= 9; ++more, ++p)
                            ms = ms * 10 + DigitValue(*p);
                        if (DigitValue(*p) <= 9) return false;
                        millisecond = static_cast<unsigned short>(ms);
                    }
                }
            }
        }
        if (*p != '[') return *p == 0;
        zone = true;
        ++p;
        int sign = 1;
        if (*p == '-' || *p == '+') sign = *p++ == '-' ? -1 : 1;
        unsigned h = DigitValue(*p);
        if (h > 9) return false;
        if (DigitValue(*++p) <= 9) h = h * 10 + DigitValue(*p++);
        if (h > 12) return false;
        unsigned f = 0;
        if (*p == '.') {
            f = DigitValue(*++p);
            if (f > 9) return false;
            if (DigitValue(*++p) <= 9)
                f = f * 10 + DigitValue(*p++);
            else
                f *= 10; // one digit counts as tenths of an hour
        }
        if (*p == ':')
            for (++p; nameLength < 3 && *p && *p != ']'; ++p) name[nameLength++] = *p;
        tzHours = static_cast<short>(sign * static_cast<int>(h));
        tzFraction = static_cast<short>(sign * static_cast<int>(f));
        return p[0] == ']' && p[1] == 0;
    }

    // Stores the fields read exactly as the general reader would have stored them.
    unsigned short StoreInto(OEDateTimeBase& d, const char* whole) const {
        if (zone) return StoreWithZone(d, whole);
        d.m_tzHours = d.m_tzFraction = 0;
        if (!d.m_tzName.IsEmpty()) d.m_tzName.Truncate(0);
        StoreDateAndTime(d);
        return 1;
    }

    void StoreDateAndTime(OEDateTimeBase& d) const {
        d.m_year = year;
        d.m_month = month;
        d.m_day = day;
        d.m_hour = hour;
        d.m_minute = minute;
        d.m_second = second;
        d.m_millisecond = millisecond;
    }

    // As StoreTimeZone, with the name's length known already. Out of line: most texts have no
    // zone, and their reading stays lean.
    __attribute__((noinline)) unsigned short StoreWithZone(OEDateTimeBase& d, const char* whole) const {
        d.m_tzName.Assign(name, nameLength);
        d.m_tzHours = tzHours;
        d.m_tzFraction = tzFraction;
        if (nameLength && d.m_tzName.IsEmpty()) {
            // No memory for the name: the general reader fails here, the other fields cleared.
            d.m_year = d.m_month = d.m_day = d.m_hour = d.m_minute = d.m_second = d.m_millisecond = 0;
            Warn(OEPW_NULLPOINTER, whole, kCtxTime);
            return 0;
        }
        StoreDateAndTime(d);
        if (ZoneNameMismatch(name, tzHours, tzFraction)) Warn(OEPW_BADFORMAT, whole, kCtxMismatch);
        return 1;
    }
};

// A text that is the zone name's own buffer goes the general way: clearing the fields first
// changes such a text, and the general reader is what defines the outcome. (While the name is
// empty its buffer holds no text that could pass for a common shape.)
unsigned short OEDateTimeBase::ConvertStringToOEDateTime(const char* text) {
    CommonShape shape;
    if (text && (m_tzName.IsEmpty() || text != m_tzName.c_str()) && shape.ReadDate(text) &&
        shape.ReadTime(text + 8))
        return shape.StoreInto(*this, text);
    return ParseDateTimeText(text);
}

unsigned short OEDateTimeBase::ConvertStringToOETime(const char* text) {
    CommonShape shape;
    if (text && (m_tzName.IsEmpty() || text != m_tzName.c_str()) && shape.ReadTime(text))
        return shape.StoreInto(*this, text);
    return ParseTimeText(text);
}

// --- The general readers --------------------------------------------------------------------

unsigned short OEDateTimeBase::ParseTimeText(const char* text) {
    unsigned pending = 0;
    if (!ParseTime(text, text, pending)) return 0;
    LogPending(pending, text);
    return 1;
}

unsigned short OEDateTimeBase::ParseTime(const char* text, const char* whole, unsigned& pending) {
    Invalidate();
    if (!text) {
        Warn(OEPW_NULLPOINTER, "", kCtxTime);
        return 0;
    }
    const char* bracket = std::strchr(text, '[');
    std::size_t len;
    if (bracket) {
        if (!ExtractTimeZone(bracket, whole, pending)) return 0;
        len = static_cast<std::size_t>(bracket - text);
    } else {
        if (std::strpbrk(text, "-:")) {
            Warn(OEPW_BADFORMAT, whole, kCtxTime);
            return 0;
        }
        len = std::strlen(text);
    }
    bool ok = true;
    if (len > 6) {
        // HHMMSS.X to HHMMSS.XXX; the digits after the point are the milliseconds.
        const std::size_t msDigits = len - 7;
        ok = text[6] == '.' && msDigits >= 1 && msDigits <= 3 &&
             ReadDigits(text + 7, static_cast<int>(msDigits), m_millisecond);
    } else {
        ok = len % 2 == 0;
    }
    if (ok && len >= 6) ok = ReadDigits(text + 4, 2, m_second);
    if (ok && len >= 4) ok = ReadDigits(text + 2, 2, m_minute);
    if (ok && len >= 2) ok = ReadDigits(text, 2, m_hour);
    if (!ok) {
        Warn(OEPW_BADFORMAT, whole, kCtxTime);
        return 0;
    }
    if (!IsValidTime()) {
        Warn(OEPW_OUTOFRANGE, whole, kCtxTime);
        return 0;
    }
    return 1;
}

unsigned short OEDateTimeBase::ParseDateTimeText(const char* text) {
    Invalidate();
    if (!text) {
        Warn(OEPW_NULLPOINTER, "", kCtxDateTime);
        return 0;
    }
    if (std::strlen(text) < 8) {
        Warn(OEPW_BADFORMAT, text, kCtxDateTime);
        return 0;
    }
    unsigned pending = 0;
    if (!ParseTime(text + 8, text, pending)) return 0;
    if (!ReadDigits(text, 4, m_year) || !ReadDigits(text + 4, 2, m_month) ||
        !ReadDigits(text + 6, 2, m_day)) {
        Warn(OEPW_BADFORMAT, text, kCtxDateTime);
        return 0;
    }
    if (!IsValidDate()) {
        Warn(OEPW_OUTOFRANGE, text, kCtxDateTime);
        return 0;
    }
    LogPending(pending, text);
    return 1;
}

unsigned short OEDateTimeBase::FormatDate(char* out) const {
    if (!IsValidDate() || !IsValidTime()) return 0;
    char* p = out;
    if (m_year < 10000) {
        p = Put2(p, m_year / 100u);
        p = Put2(p, m_year);
    } else {
        p = PutUnsigned(p, m_year, 4);
    }
    p = Put2(p, m_month);
    p = Put2(p, m_day);
    const bool zone = m_tzHours || m_tzFraction;
    if (m_hour || m_minute || m_second || m_millisecond || zone) {
        p = Put2(p, m_hour);
        p = Put2(p, m_minute);
        p = Put2(p, m_second);
        if (m_millisecond || zone) {
            // Valid milliseconds are at most 999: three digits.
            *p++ = '.';
            *p++ = static_cast<char>('0' + m_millisecond / 100u);
            p = Put2(p, m_millisecond);
        }
        if (zone) {
            *p++ = '[';
            if (m_tzHours == 0 && m_tzFraction < 0) {
                *p++ = '-';
                *p++ = '0';
            } else {
                p = PutSigned(p, m_tzHours);
            }
            if (m_tzFraction) {
                *p++ = '.';
                p = PutUnsigned(p, static_cast<unsigned>(m_tzFraction < 0 ? -m_tzFraction : m_tzFraction), 2);
            }
            if (!m_tzName.IsEmpty()) {
                *p++ = ':';
                p = PutName(p, m_tzName);
            }
            *p++ = ']';
        }
    }
    return static_cast<unsigned short>(p - out);
}

unsigned short OEDateTimeBase::GetDateString(OEString& out) const {
    char buf[kDateTextSize];
    const unsigned short n = FormatDate(buf);
    return n ? out.Assign(buf, n) : 0;
}

unsigned short OEDateTimeBase::GetTimeString(OEString& out) const {
    if (!IsValidTime()) return 0;
    char buf[40];
    char* p = Put2(buf, m_hour);
    p = Put2(p, m_minute);
    p = Put2(p, m_second);
    if (m_millisecond) {
        *p++ = '.';
        p = PutUnsigned(p, m_millisecond, 1); // not padded in the time form
    }
    if (m_tzHours) {
        *p++ = '[';
        p = PutSigned(p, m_tzHours);
        if (m_tzFraction) {
            // The fraction keeps its sign here ([-3.-50]); only the date form writes its
            // absolute value. Kept so.
            *p++ = '.';
            p = PutSigned2(p, m_tzFraction);
        }
        if (!m_tzName.IsEmpty()) {
            *p++ = ':';
            p = PutName(p, m_tzName);
        }
        *p++ = ']';
    } else if (!m_tzName.IsEmpty()) {
        *p++ = ':';
        p = PutName(p, m_tzName);
    }
    return out.Assign(buf, static_cast<unsigned short>(p - buf));
}

long long OEDateTimeBase::GetTimeT() const {
    if (m_year < 1902) return kOutOfRange;
    long long year = m_year;
    long long blocks = 0;
    if (year < 1970) {
        // Moved forward by whole four-year blocks of 1461 days, taken off again at the end.
        blocks = (1969 - year) / 4 + 1;
        year += 4 * blocks;
    }
    long long t =
        DaysFromCivil(year, m_month, m_day) * kSecondsPerDay + m_hour * 3600LL + m_minute * 60LL + m_second;
    t -= blocks * kFourYears;
    t -= (m_tzHours * 100LL + m_tzFraction) * 36;
    return t;
}

long long OEDateTimeBase::LocalTimeZoneOffset() {
    const OEPlatform::OETime64 now = OEPlatform::Time64(nullptr);
    std::tm local{};
    if (!OEPlatform::LocalTime64(now, &local)) return 0;
    const long long asUtc =
        DaysFromCivil(local.tm_year + 1900LL, local.tm_mon + 1LL, local.tm_mday) * kSecondsPerDay +
        local.tm_hour * 3600LL + local.tm_min * 60LL + local.tm_sec;
    return asUtc - now;
}

void OEDateTimeBase::SetFromCivil(long long y, unsigned m, unsigned d, long long secondsOfDay) {
    m_year = static_cast<unsigned short>(y);
    m_month = static_cast<unsigned short>(m);
    m_day = static_cast<unsigned short>(d);
    m_hour = static_cast<unsigned short>(secondsOfDay / 3600);
    m_minute = static_cast<unsigned short>(secondsOfDay / 60 % 60);
    m_second = static_cast<unsigned short>(secondsOfDay % 60);
}

unsigned short OEDateTimeBase::AssignSeconds(long long seconds) {
    if (seconds < kMinSeconds || seconds > kMaxSeconds) return 0;
    // A negative count is raised by whole four-year blocks of 1461 days until it is not
    // negative, and the year lowered by four per block afterwards. Before March 1901 this takes
    // every fourth year for a leap year (1900 among them), as it always has.
    long long blocks = 0;
    if (seconds < 0) {
        blocks = (kFourYears - 1 - seconds) / kFourYears;
        seconds += blocks * kFourYears;
    }
    long long y;
    unsigned m, d;
    CivilFromDays(seconds / kSecondsPerDay, y, m, d);
    y -= 4 * blocks;
    if (y < 1) return 0;
    SetFromCivil(y, m, d, seconds % kSecondsPerDay);
    m_millisecond = 0;
    m_tzHours = 0;
    m_tzFraction = 0;
    return 1;
}

unsigned short OEDateTimeBase::FromPrecInt(const OEPrecisionInteger& seconds) {
    // Below three decimals the rescale multiplies: a magnitude past 63 bits could wrap to a
    // plausible count, so it is refused first.
    if (!seconds.IsValid() || (seconds.Decimal() < 3 && !seconds.FitInASInt64())) return 0;
    OEPrecisionInteger ms(seconds);
    ms.Decimal(3);
    if (!ms.FitInASInt64()) return 0;
    const long long total = ms.GetOEINT64();
    const long long whole = FloorDiv(total, 1000);
    if (!AssignSeconds(whole)) return 0;
    m_millisecond = static_cast<unsigned short>(total - whole * 1000);
    return 1;
}

unsigned short OEDateTimeBase::ConvertToGMT() {
    if (!IsValidDate() || !IsValidTime() || m_year < 1902) return 0;
    return AssignSeconds(GetTimeT());
}

unsigned short OEDateTimeBase::ConvertToLocalTime(short hours, short fraction) {
    if (!IsValidDate() || !IsValidTime() || m_year < 1902) return 0;
    if (!AssignSeconds(GetTimeT() + (hours * 100LL + fraction) * 36)) return 0;
    m_tzHours = hours;
    m_tzFraction = fraction;
    return 1;
}

OEDateTimeBase& OEDateTimeBase::operator+=(long long seconds) {
    // A date before 1902 has no count of seconds; it is left as it is.
    if (m_year < 1902) return *this;
    const long long t = GetTimeT();
    // A sum outside what AssignSeconds takes is refused before it can overflow.
    if (seconds > kMaxSeconds - t || seconds < kMinSeconds - t) return *this;
    if (AssignSeconds(t + seconds)) m_tzName.Truncate(0);
    return *this;
}

OEDateTimeBase& OEDateTimeBase::operator+=(const OEPrecisionInteger& seconds) {
    const OEPrecisionInteger whole = seconds.Integer();
    if (whole.IsValid() && whole.FitInASInt64()) operator+=(whole.GetOEINT64());
    return *this;
}

OEDateTimeBase& OEDateTimeBase::operator+=(const OEDateTimeBase& other) {
    if (other.m_year >= 1902) operator+=(other.GetTimeT());
    return *this;
}

// Milliseconds since 1970 in universal time, for every year.
static long long InstantMs(unsigned short y, unsigned short mo, unsigned short d, unsigned short h,
                           unsigned short mi, unsigned short s, unsigned short ms, short tzh, short tzf) {
    return (DaysFromCivil(y, mo, d) * kSecondsPerDay + h * 3600LL + mi * 60LL + s -
            (tzh * 100LL + tzf) * 36) *
               1000 +
           ms;
}

OEPrecisionInteger OEDateTimeBase::GetGMT() const {
    return OEPrecisionInteger(
        InstantMs(m_year, m_month, m_day, m_hour, m_minute, m_second, m_millisecond, m_tzHours, m_tzFraction),
        3);
}

OEPrecisionInteger OEDateTimeBase::SecondsBetween(const OEDateTimeBase& other) const {
    return other.GetGMT() - GetGMT();
}

int OEDateTimeBase::compareDateTime(const OEDateTimeBase& other) const {
    const long long a =
        InstantMs(m_year, m_month, m_day, m_hour, m_minute, m_second, m_millisecond, m_tzHours, m_tzFraction);
    const long long b = InstantMs(other.m_year, other.m_month, other.m_day, other.m_hour, other.m_minute,
                                  other.m_second, other.m_millisecond, other.m_tzHours, other.m_tzFraction);
    return a == b ? 0 : (a > b ? 1 : -1);
}

static void Put16(unsigned char* p, unsigned v) {
    p[0] = static_cast<unsigned char>(v);
    p[1] = static_cast<unsigned char>(v >> 8);
}
static unsigned short Get16(const unsigned char* p) {
    return static_cast<unsigned short>(p[0] | (static_cast<unsigned>(p[1]) << 8));
}

unsigned short OEDateTimeBase::ExportBinary(unsigned char* block, unsigned long* size) const {
    if (!block) return 0;
    const unsigned short fields[10] = {kBinaryVersion,
                                       m_year,
                                       m_month,
                                       m_day,
                                       m_hour,
                                       m_minute,
                                       m_second,
                                       m_millisecond,
                                       static_cast<unsigned short>(m_tzHours),
                                       static_cast<unsigned short>(m_tzFraction)};
    for (int i = 0; i < 10; ++i) Put16(block + 2 * i, fields[i]);
    std::memset(block + 20, 0, 4);
    std::memcpy(block + 20, m_tzName.c_str(), m_tzName.GetStrLength() < 3 ? m_tzName.GetStrLength() : 3);
    if (size) *size = kBinaryRecordSize;
    return 1;
}

unsigned short OEDateTimeBase::ImportBinary(const unsigned char* block) {
    if (!block || Get16(block) != kBinaryVersion) return 0;
    m_year = Get16(block + 2);
    m_month = Get16(block + 4);
    m_day = Get16(block + 6);
    m_hour = Get16(block + 8);
    m_minute = Get16(block + 10);
    m_second = Get16(block + 12);
    m_millisecond = Get16(block + 14);
    m_tzHours = static_cast<short>(Get16(block + 16));
    m_tzFraction = static_cast<short>(Get16(block + 18));
    char name[4] = {0, 0, 0, 0};
    std::memcpy(name, block + 20, 3);
    m_tzName = name;
    return 1;
}

unsigned char* OEDateTimeBase::LockBuffer() {
    if (!m_binary) m_binary = static_cast<unsigned char*>(OEMemory::Calloc(kBinaryRecordSize));
    return m_binary;
}

void OEDateTimeBase::UnLockBuffer() {
    OEMemory::Free(m_binary);
    m_binary = nullptr;
}

// --- OEDateTime, OETime -------------------------------------------------------------------

OEDateTime::OEDateTime(short year, short month, short day, short hour, short minute, short second,
                       short millisecond, short tzHours, short tzFraction)
    : OEDateTimeBase(year, month, day, hour, minute, second, millisecond, tzHours, tzFraction) {}

OEDateTime::OEDateTime(const char* text) {
    ConvertStringToOEDateTime(text);
}

OEDateTime::OEDateTime(const OEPrecisionInteger& seconds) {
    FromPrecInt(seconds);
}

OEDateTime& OEDateTime::operator=(const char* text) {
    ConvertStringToOEDateTime(text);
    return *this;
}

// Kept as it has always been: the result is this date-time itself.
OEDateTime OEDateTime::TimeBetween(const OEDateTimeBase&) const {
    return *this;
}

OETime::OETime(short year, short month, short day, short hour, short minute, short second, short millisecond,
               short tzHours, short tzFraction)
    : OEDateTimeBase(year, month, day, hour, minute, second, millisecond, tzHours, tzFraction) {}

OETime::OETime(const char* text) {
    ConvertStringToOETime(text);
}

OETime& OETime::operator=(const char* text) {
    ConvertStringToOETime(text);
    return *this;
}

OETime OETime::TimeBetween(const OEDateTimeBase&) const {
    return *this;
}

// --- OEPayrollDateTime ----------------------------------------------------------------------

OEPayrollDateTime::OEPayrollDateTime(const char* text) : m_empty(0) {
    Assign(text);
}

OEPayrollDateTime::OEPayrollDateTime(short year, short month, short day, short hour, short minute,
                                     short second, short millisecond)
    : OEDateTime(year, month, day, hour, minute, second, millisecond, 0, 0), m_empty(0) {}

OEPayrollDateTime& OEPayrollDateTime::operator=(const char* text) {
    Assign(text);
    return *this;
}

OEPayrollDateTime& OEPayrollDateTime::operator=(const OEPayrollDateTime& other) {
    OEDateTime::operator=(other);
    m_empty = other.m_empty;
    return *this;
}

unsigned short OEPayrollDateTime::Assign(const char* text) {
    if (text && (std::strcmp(text, kEmptyMarker) == 0 || std::strcmp(text, kEmptyMarkerLong) == 0)) {
        m_empty = 1;
        return 1;
    }
    m_empty = 0;
    return ConvertStringToOEDateTime(text);
}

unsigned short OEPayrollDateTime::GetDateString(OEString& out) const {
    if (m_empty) return out.Assign(kEmptyMarker, 4);
    return OEDateTime::GetDateString(out);
}
