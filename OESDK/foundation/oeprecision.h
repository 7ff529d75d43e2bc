// OEPrecisionInteger: the library's exact decimal number. A 96-bit unsigned magnitude, a sign
// and a decimal scale (the number of the magnitude's low decimal digits that lie after the
// point): value = sign x magnitude / 10^scale. Every amount, quantity, price and rate is one.
//
// No floating point is used anywhere. Arithmetic wraps modulo 2^96 without notice; scales are
// never lowered implicitly (multiplication adds them, the caller rescales with Decimal()).
#ifndef OESDK_FOUNDATION_OEPRECISION_H
#define OESDK_FOUNDATION_OEPRECISION_H

#include "oeexport.h"

#include <cstdint>

class OE_API OEPrecisionInteger {
public:
    // Size of the binary record written by ExportBinary (18 bytes used, 2 left untouched).
    enum : unsigned short { kBinaryRecordSize = 20, kBinaryVersion = 1, kMaxDigits = 29, kTextSize = 32 };

    OEPrecisionInteger()
        : m_lo(0), m_mid(0), m_hi(0), m_sign(1), m_scale(0), m_text(nullptr), m_binary(nullptr),
          m_binaryLen(0) {}
    // The raw integer is the scaled magnitude: (12345, 2) is 123.45.
    OEPrecisionInteger(std::int32_t value, unsigned short scale);
    OEPrecisionInteger(long long value, unsigned short scale);
    OEPrecisionInteger(unsigned long long value, unsigned short scale);
    // As ConvertStringToOEPrecisionInteger (a bad text is logged to the thread's parse log).
    explicit OEPrecisionInteger(const char* text);
    // Copies the value fields only; the copy owns no buffers.
    OEPrecisionInteger(const OEPrecisionInteger& other);
    virtual ~OEPrecisionInteger();

    // 1-4
    virtual OEPrecisionInteger& operator=(const char* text);
    virtual OEPrecisionInteger& operator=(long long value);
    virtual OEPrecisionInteger& operator=(std::int32_t value);
    virtual OEPrecisionInteger& operator=(const OEPrecisionInteger& other);
    // 5. Resets to zero, then reads [+|-]digits with ',' grouping and one '.'; returns 1 on
    // success. On failure one parse warning is logged (4 malformed, 6 more than 28 digits) and
    // the number keeps what was read up to the error.
    virtual unsigned short ConvertStringToOEPrecisionInteger(const char* text);
    // 6-11. A negative zero is not equal to a positive zero; with different signs the positive
    // operand is the greater one.
    virtual unsigned short operator==(const OEPrecisionInteger& other) const;
    virtual unsigned short operator!=(const OEPrecisionInteger& other) const;
    virtual unsigned short operator>(const OEPrecisionInteger& other) const;
    virtual unsigned short operator>=(const OEPrecisionInteger& other) const;
    virtual unsigned short operator<(const OEPrecisionInteger& other) const;
    virtual unsigned short operator<=(const OEPrecisionInteger& other) const;
    // 12-15. Shift the magnitude in place (sign and scale untouched); all four return *this.
    virtual OEPrecisionInteger& operator<<(unsigned short bits);
    virtual OEPrecisionInteger& operator>>(unsigned short bits);
    virtual OEPrecisionInteger& operator<<=(unsigned short bits);
    virtual OEPrecisionInteger& operator>>=(unsigned short bits);
    // 16-21
    virtual OEPrecisionInteger& operator+=(const OEPrecisionInteger& other);
    virtual OEPrecisionInteger& operator-=(const OEPrecisionInteger& other);
    virtual OEPrecisionInteger operator+(const OEPrecisionInteger& other) const;
    virtual OEPrecisionInteger operator-(const OEPrecisionInteger& other) const;
    // Truncating division. A divisor whose absolute value is below 1 (zero included), or whose
    // raw magnitude is 1 whatever its scale and sign, returns a copy of the dividend.
    virtual OEPrecisionInteger operator/(const OEPrecisionInteger& other) const;
    // The result's scale is the sum of the scales (no rescaling).
    virtual OEPrecisionInteger operator*(const OEPrecisionInteger& other) const;
    // 22-26
    virtual OEPrecisionInteger Mul10() const;
    virtual void Mul10InPlace();
    virtual OEPrecisionInteger Div10() const;
    virtual OEPrecisionInteger abs() const;
    virtual void Negate();
    // 27. The integer part (truncated), scale 0. 28. An unchanged copy of the whole number:
    // callers must not rely on it to strip the integer part.
    virtual OEPrecisionInteger Integer() const;
    virtual OEPrecisionInteger Fraction() const;
    // 29. Text form in the number's own 32-byte buffer, valid until the next conversion or the
    // number's destruction; null when memory is short. Never compare a number with 0 through
    // this conversion: use IsZero().
    virtual operator char*();
    // The same text written into `out` (room for kTextSize bytes, NUL included); returns its
    // length. Allocates nothing: the builder writes numbers through it.
    unsigned short FormatText(char* out) const;
    // 30. Rescales by multiplying or truncating-dividing by ten. 31. The scale.
    virtual void Decimal(unsigned short scale);
    virtual unsigned short Decimal() const;
    // 32-37. Whether the magnitude fits; sign and scale are not looked at.
    virtual unsigned short FitInASInt64() const;
    virtual unsigned short FitInAUInt64() const;
    virtual unsigned short FitInASLong() const;
    virtual unsigned short FitInAULong() const;
    virtual unsigned short FitInASShort() const;
    virtual unsigned short FitInAUShort() const;
    // 38-42
    virtual short Sign() const;
    virtual unsigned short IsZero() const;
    virtual unsigned short IsPositive() const;
    virtual unsigned short IsNegative() const;
    virtual unsigned short IsValid() const;
    // 43-51. Raw magnitude accessors (scale ignored).
    virtual unsigned long long GetOEUINT64() const;
    virtual long long GetOEINT64() const;
    virtual std::uint32_t GetOEULong() const;
    virtual std::int32_t GetOESLong() const;
    virtual std::uint16_t GetOEUShort() const;
    virtual std::int16_t GetOESShort() const;
    virtual std::uint32_t GetLSBytes() const;
    virtual std::uint32_t GetSSBytes() const;
    virtual std::uint32_t GetMSBytes() const;

    // Sets the scale without touching the magnitude; refuses (0) a scale above 29.
    unsigned short SetDecimal(unsigned short scale);
    // Writes the 20-byte little-endian record (version 1) and stores its size in *size.
    // Returns 0 when block is null.
    unsigned short ExportBinary(unsigned char* block, unsigned long* size);
    // Reads a record; does nothing (returns 0) unless its version field reads 1.
    unsigned short ImportBinary(const unsigned char* block);
    // A 20-byte block owned by the number (allocated once); null when memory is short.
    unsigned char* LockBuffer();
    void UnLockBuffer();
    unsigned long BinaryLength() const { return m_binaryLen; }

    static const OEPrecisionInteger OEZero;
    static const OEPrecisionInteger OEOneHundred;
    static const OEPrecisionInteger OEPIOctillion;     // 10^27
    static const OEPrecisionInteger OEPITenPentillion; // 10^19

protected:
    unsigned short Bit(unsigned short n) const;
    // Brings both numbers to the larger of their scales (never lowers one).
    static void RightAlign(OEPrecisionInteger& a, OEPrecisionInteger& b);
    // Number of decimal digits of the magnitude, capped at 29.
    unsigned short MSD() const;
    // The text conversion over [begin, end); warnings carry `report` as the offending text.
    unsigned short ParseText(const char* begin, const char* end, const char* report);
    // Text buffer of the number (allocated on first use); null when memory is short.
    char* TextBuffer();

    std::uint32_t m_lo;
    std::uint32_t m_mid;
    std::uint32_t m_hi;
    short m_sign;
    unsigned short m_scale;
    char* m_text;
    unsigned char* m_binary;
    unsigned long m_binaryLen;
};

// A percentage: valid only from 0 to 100 inclusive (compared as decimal values).
class OE_API OEPercent : public OEPrecisionInteger {
public:
    OEPercent() {}
    OEPercent(const OEPercent& other) : OEPrecisionInteger(other) {}
    OEPercent(std::int32_t value, unsigned short scale) : OEPrecisionInteger(value, scale) {}
    explicit OEPercent(const char* text) : OEPrecisionInteger(text) {}
    OEPercent& operator=(const OEPercent& other) {
        OEPrecisionInteger::operator=(other);
        return *this;
    }
    using OEPrecisionInteger::operator=;
    unsigned short IsValid() const override;
};

// A number that must not be negative (unit prices). A negative zero counts as zero.
class OE_API OEPosPrecisionInteger : public OEPrecisionInteger {
public:
    OEPosPrecisionInteger() {}
    OEPosPrecisionInteger(const OEPrecisionInteger& other) : OEPrecisionInteger(other) {}
    OEPosPrecisionInteger(const OEPosPrecisionInteger& other) : OEPrecisionInteger(other) {}
    OEPosPrecisionInteger(long long value, unsigned short scale) : OEPrecisionInteger(value, scale) {}
    explicit OEPosPrecisionInteger(const char* text) : OEPrecisionInteger(text) {}
    OEPosPrecisionInteger& operator=(const OEPosPrecisionInteger& other) {
        OEPrecisionInteger::operator=(other);
        return *this;
    }
    using OEPrecisionInteger::operator=;
    unsigned short IsValid() const override;
};

#endif
