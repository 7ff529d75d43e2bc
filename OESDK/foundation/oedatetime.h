// OFX date-times: YYYYMMDD[HHMMSS[.XXX]][[offset[:name]]]. Calendar fields, milliseconds and a
// zone offset in hours and hundredths of an hour ((hours x 100 + fraction) x 36 seconds east of
// universal time), with an optional three-letter zone name.
//
// All conversions between fields and seconds are pure proleptic-Gregorian arithmetic in
// universal time, so no result depends on the machine's time zone. Only LocalTimeZoneOffset()
// asks the platform for the host's local time.
#ifndef OESDK_FOUNDATION_OEDATETIME_H
#define OESDK_FOUNDATION_OEDATETIME_H

#include "oeexport.h"
#include "foundation/oeprecision.h"
#include "foundation/oestring.h"

class OE_API OEDateTimeBase {
public:
    // Binary record: version 1, the nine numeric fields as 16-bit little-endian words, the zone
    // name in 4 bytes (NUL padded) = 24 bytes.
    enum : unsigned short { kBinaryRecordSize = 24, kBinaryVersion = 1 };
    // GetTimeT of a year before 1902.
    static constexpr long long kOutOfRange = 2147483648LL;

    OEDateTimeBase()
        : m_year(0), m_month(0), m_day(0), m_hour(0), m_minute(0), m_second(0), m_millisecond(0),
          m_tzHours(0), m_tzFraction(0), m_binary(nullptr) {}
    OEDateTimeBase(const OEDateTimeBase& other);
    virtual ~OEDateTimeBase();

    // Parses a date-time (here and in OEDateTime) or a time (OETime); failures are logged.
    virtual OEDateTimeBase& operator=(const char* text);
    // Time form: HHMMSS[.ms][[zone[.fraction][:name]]], milliseconds not padded, the fraction with
    // its sign; the zone only when its hours are not 0 (else ":name" alone). 1, or 0 when invalid.
    virtual unsigned short GetTimeString(OEString& out) const;
    virtual unsigned short IsValidTime() const;
    // Date form: YYYYMMDD[HHMMSS[.XXX][[zone[:name]]]]. 1, or 0 (out untouched) when invalid.
    virtual unsigned short GetDateString(OEString& out) const;
    virtual unsigned short IsValidDate() const;
    // The same date form written into `out` (room for kDateTextSize bytes, no NUL added): its
    // length, or 0 when the date-time is not valid. OEDateTimeBase::GetDateString is this text.
    enum : unsigned short { kDateTextSize = 48 };
    unsigned short FormatDate(char* out) const;

    OEDateTimeBase& operator=(const OEDateTimeBase& other);
    // Seconds since 1970 in universal time; fields become that instant, zone 0, milliseconds 0,
    // name kept. A negative count is counted in four-year blocks of 1461 days (so before March
    // 1901 every fourth year is a leap year). Returns 0 (object unchanged) outside the years 1
    // to 3000.
    unsigned short AssignSeconds(long long seconds);
    // An OEPrecisionInteger count of seconds since 1970 (universal time); its fraction becomes
    // the milliseconds (truncated). Returns 0 (object unchanged) when out of range or invalid.
    unsigned short FromPrecInt(const OEPrecisionInteger& seconds);

    // Both read the common shapes (digits, an optional .XXX and a well-formed zone) in one pass
    // and hand anything else to the general readers below, which they match in every result,
    // stored field and logged warning.
    unsigned short ConvertStringToOEDateTime(const char* text);
    unsigned short ConvertStringToOETime(const char* text);

    static unsigned short IsLeapYear(unsigned short year);
    static unsigned short DaysInMonth(unsigned short month, unsigned short year);
    unsigned short DaysInMonth() const { return DaysInMonth(m_month, m_year); }
    // Month and day from the day of the year (1-365, 366 in a leap year); 0 when refused.
    unsigned short SetDay(unsigned short dayOfYear, unsigned short year);

    unsigned short GetYear() const { return m_year; }
    unsigned short GetMonth() const { return m_month; }
    unsigned short GetDay() const { return m_day; }
    unsigned short GetHour() const { return m_hour; }
    unsigned short GetMinute() const { return m_minute; }
    unsigned short GetSecond() const { return m_second; }
    unsigned short GetMillisecond() const { return m_millisecond; }
    short GetTimeZoneHours() const { return m_tzHours; }
    short GetTimeZoneFraction() const { return m_tzFraction; }
    const OEString3& GetTimeZone() const { return m_tzName; }
    // Stores the zone. A North American name that does not belong to an offset of -4 to -8 hours
    // is kept but logged (warning 4). Always returns 1.
    unsigned short SetTimeZone(const char* name, short hours, short fraction);

    // Seconds since 1970, universal time (milliseconds ignored); 2147483648 for years before 1902.
    long long GetTimeT() const;
    // The host's current offset from universal time, in seconds east (local time truly meant).
    static long long LocalTimeZoneOffset();
    // Move to universal time / to the zone (hours, fraction). They return 0 and leave the object
    // unchanged when it is not a valid date-time from 1902 on.
    unsigned short ConvertToGMT();
    unsigned short ConvertToLocalTime(short hours, short fraction);

    // The object becomes GetTimeT() plus the seconds, universal time, zone and name cleared.
    OEDateTimeBase& operator+=(long long seconds);
    // Adds the integer part of a number of seconds.
    OEDateTimeBase& operator+=(const OEPrecisionInteger& seconds);
    // Adds the other date-time's GetTimeT() as a number of seconds.
    OEDateTimeBase& operator+=(const OEDateTimeBase& other);

    // The instant in universal time: seconds since 1970 with scale 3 (milliseconds).
    OEPrecisionInteger GetGMT() const;
    // other - this, in seconds (scale 3).
    OEPrecisionInteger SecondsBetween(const OEDateTimeBase& other) const;

    unsigned short operator==(const OEDateTimeBase& other) const { return compareDateTime(other) == 0; }
    unsigned short operator!=(const OEDateTimeBase& other) const { return compareDateTime(other) != 0; }
    unsigned short operator<(const OEDateTimeBase& other) const { return compareDateTime(other) < 0; }
    unsigned short operator<=(const OEDateTimeBase& other) const { return compareDateTime(other) <= 0; }
    unsigned short operator>(const OEDateTimeBase& other) const { return compareDateTime(other) > 0; }
    unsigned short operator>=(const OEDateTimeBase& other) const { return compareDateTime(other) >= 0; }
    int compareDateTime(const OEDateTimeBase& other) const;

    // Clears every field (an invalid date). The name keeps its buffer for the next zone.
    void Invalidate() {
        m_year = m_month = m_day = m_hour = m_minute = m_second = m_millisecond = 0;
        m_tzHours = m_tzFraction = 0;
        if (!m_tzName.IsEmpty()) m_tzName.Truncate(0);
    }
    unsigned short ExportBinary(unsigned char* block, unsigned long* size) const;
    unsigned short ImportBinary(const unsigned char* block);
    unsigned char* LockBuffer();
    void UnLockBuffer();

protected:
    // The fields as given, name empty, nothing validated (OEDateTime, OETime).
    OEDateTimeBase(short year, short month, short day, short hour, short minute, short second,
                   short millisecond, short tzHours, short tzFraction);
    // Irregularities of a zone that do not fail the parse; they are logged only once the whole
    // conversion has succeeded, so a failed conversion logs exactly its one failure.
    enum : unsigned { kZoneIrregular = 1, kZoneNameMismatch = 2 };
    // The general readers of a date-time and of a time: every text, step by step.
    unsigned short ParseDateTimeText(const char* text);
    unsigned short ParseTimeText(const char* text);
    // A text of a common shape, read whole and checked before anything is stored (oedatetime.cpp).
    struct CommonShape;
    // `whole` is the text reported in warnings (the whole input of a date-time parse).
    unsigned short ParseTime(const char* text, const char* whole, unsigned& pending);
    // Returns 0 (warning logged) when the zone text is malformed.
    unsigned short ExtractTimeZone(const char* zone, const char* whole, unsigned& pending);
    // Stores the zone; true when a North American name does not belong to the offset.
    bool StoreTimeZone(const char* name, short hours, short fraction);
    static void LogPending(unsigned pending, const char* whole);
    void SetFromCivil(long long year, unsigned month, unsigned day, long long secondsOfDay);

    unsigned short m_year;
    unsigned short m_month;
    unsigned short m_day;
    unsigned short m_hour;
    unsigned short m_minute;
    unsigned short m_second;
    unsigned short m_millisecond;
    short m_tzHours;
    short m_tzFraction;
    OEString3 m_tzName;
    unsigned char* m_binary;
};

class OE_API OEDateTime : public OEDateTimeBase {
public:
    OEDateTime() {}
    OEDateTime(const OEDateTime& other) : OEDateTimeBase(other) {}
    // Fields as given, name empty, nothing validated.
    OEDateTime(short year, short month, short day, short hour, short minute, short second, short millisecond,
               short tzHours, short tzFraction);
    explicit OEDateTime(const char* text);
    explicit OEDateTime(const OEPrecisionInteger& seconds);

    OEDateTime& operator=(const char* text) override;
    OEDateTime& operator=(const OEDateTime& other) {
        OEDateTimeBase::operator=(other);
        return *this;
    }
    OEDateTime& operator=(long long seconds) {
        AssignSeconds(seconds);
        return *this;
    }
    OEDateTime& operator=(const OEPrecisionInteger& seconds) {
        FromPrecInt(seconds);
        return *this;
    }
    // A copy of this date-time, whatever the argument (kept so).
    OEDateTime TimeBetween(const OEDateTimeBase& other) const;
};

class OE_API OETime : public OEDateTimeBase {
public:
    OETime() {}
    OETime(const OETime& other) : OEDateTimeBase(other) {}
    OETime(short year, short month, short day, short hour, short minute, short second, short millisecond,
           short tzHours, short tzFraction);
    explicit OETime(const char* text);

    OETime& operator=(const char* text) override;
    OETime& operator=(const OETime& other) {
        OEDateTimeBase::operator=(other);
        return *this;
    }
    OETime& operator=(long long seconds) {
        AssignSeconds(seconds);
        return *this;
    }
    OETime TimeBetween(const OEDateTimeBase& other) const;
};

// A payroll date-time, which can also be the clear-this-field marker "^@~*" (on input also
// "__OFX_EMPTY_STRING__").
class OE_API OEPayrollDateTime : public OEDateTime {
public:
    OEPayrollDateTime() : m_empty(0) {}
    OEPayrollDateTime(const OEPayrollDateTime& other) : OEDateTime(other), m_empty(other.m_empty) {}
    explicit OEPayrollDateTime(const char* text);
    // Year to millisecond; the zone is 0.
    OEPayrollDateTime(short year, short month, short day, short hour, short minute, short second,
                      short millisecond);

    OEPayrollDateTime& operator=(const char* text) override;
    OEPayrollDateTime& operator=(const OEPayrollDateTime& other);
    // Seconds since 1970 (universal time) or a number of seconds, as in OEDateTime; a successful
    // assignment clears the empty flag.
    OEPayrollDateTime& operator=(long long seconds) {
        if (AssignSeconds(seconds)) m_empty = 0;
        return *this;
    }
    OEPayrollDateTime& operator=(const OEPrecisionInteger& seconds) {
        if (FromPrecInt(seconds)) m_empty = 0;
        return *this;
    }
    unsigned short GetDateString(OEString& out) const override;

    // Sets or clears the empty flag; the other fields are left alone.
    void SetEmpty(unsigned short empty) { m_empty = empty ? 1 : 0; }
    unsigned short IsEmpty() const { return m_empty; }
    // "^@~*" and "__OFX_EMPTY_STRING__" set the flag; anything else is parsed as a date-time
    // (the flag cleared). Returns 1 or 0.
    unsigned short Assign(const char* text);

private:
    unsigned short m_empty;
};

#endif
