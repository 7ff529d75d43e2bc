// OEPayrollAmount: an amount of the payroll message set. A decimal number with three flags:
// percent (written with a trailing '%'), money (written with two decimals) and empty (the
// clear-this-field marker "^@~*"). A money amount can also carry a '$' (SetDollarSign).
#ifndef OESDK_FOUNDATION_OEPAYROLLAMOUNT_H
#define OESDK_FOUNDATION_OEPAYROLLAMOUNT_H

#include "oeexport.h"
#include "foundation/oeprecision.h"

enum OEPayrollAmountType { OEPAT_EMPTY = 0, OEPAT_MONEY = 1 };

class OE_API OEPayrollAmount : public OEPrecisionInteger {
public:
    OEPayrollAmount();
    OEPayrollAmount(const OEPayrollAmount& other);
    OEPayrollAmount(const OEPrecisionInteger& value, unsigned short percent, unsigned short money);
    OEPayrollAmount(long long raw, unsigned short scale, unsigned short percent);
    explicit OEPayrollAmount(const char* text);
    // OEPAT_EMPTY: the empty marker; OEPAT_MONEY: a money amount of 0 with scale 2.
    explicit OEPayrollAmount(OEPayrollAmountType type);

    OEPayrollAmount& operator=(const OEPayrollAmount& other);
    OEPayrollAmount& operator=(const char* text) override;
    using OEPrecisionInteger::operator=;

    // "^@~*" and "__OFX_EMPTY_STRING__" make the amount empty. Anything else is a number,
    // optionally with a '$' in front of the digits (sets money and dollar sign) and a trailing
    // '%' (sets percent); the empty flag is cleared. Warnings as for any number.
    unsigned short Assign(const char* text);

    // The payroll text form (at most 30 characters; see the .cpp for the rules); null when
    // memory is short.
    operator char*() override;

    // False when either amount is empty; otherwise equal flags and equal numbers. Compared with
    // a plain number, the flags are taken as clear.
    unsigned short operator==(const OEPrecisionInteger& other) const override;
    unsigned short operator!=(const OEPrecisionInteger& other) const override;

    unsigned short IsPercent() const { return m_percent; }
    unsigned short IsEmpty() const { return m_empty; }
    unsigned short IsMoney() const { return m_money; }
    unsigned short HasDollarSign() const { return m_dollar; }
    void SetPercent(unsigned short on) { m_percent = on ? 1 : 0; }
    void SetEmpty(unsigned short on) { m_empty = on ? 1 : 0; }
    void SetMoney(unsigned short on) { m_money = on ? 1 : 0; }
    // Writes a '$' before a money amount (after its sign). Off by default.
    void SetDollarSign(unsigned short on) { m_dollar = on ? 1 : 0; }

private:
    unsigned short m_percent;
    unsigned short m_empty;
    unsigned short m_money;
    unsigned short m_dollar;
};

#endif
