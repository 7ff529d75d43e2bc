// CURRENCY / ORIGCURRENCY: a currency rate and symbol.
#ifndef OESDK_MESSAGES_OECURRENCY_H
#define OESDK_MESSAGES_OECURRENCY_H
#include "messages/oeaggregate.h"

class OE_API OECurrency : public OEAggregate {
public:
    explicit OECurrency(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEPrecisionInteger* GetCurrencyRate() const { return GetAmount(OETAG_CURRATE); }
    unsigned short SetCurrencyRate(const OEString& v) { return SetFromText(OETAG_CURRATE, v); }
    unsigned short SetCurrencyRate(const OEPrecisionInteger& v) { return SetAmount(OETAG_CURRATE, v); }
    const OEString* GetCurrencySymbol() const { return GetText(OETAG_CURSYM); }
    // An empty text returns 3 and marks nothing; a text longer than 3 is kept and logged.
    unsigned short SetCurrencySymbol(const OEString& v) {
        return v.IsEmpty() ? 3 : SetFromText(OETAG_CURSYM, v);
    }

    OEPrecisionInteger m_curRate;
    OEString3 m_curSym;
};

#endif
