// CURRENCY / ORIGCURRENCY: a currency rate and symbol.
#ifndef OESDK_MESSAGES_OECURRENCY_H
#define OESDK_MESSAGES_OECURRENCY_H
#include "messages/oeaggregate.h"

class OE_API OECurrency : public OEAggregate {
public:
    explicit OECurrency(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_AMOUNT_ACCESSORS(CurrencyRate, OETAG_CURRATE);
    OE_GET_TEXT(CurrencySymbol, OETAG_CURSYM);
    // An empty text returns 3 and marks nothing; a text longer than 3 is kept and logged.
    unsigned short SetCurrencySymbol(const OEString& v) {
        return v.IsEmpty() ? 3 : SetFromText(OETAG_CURSYM, v);
    }

    OEPrecisionInteger m_curRate;
    OEString3 m_curSym;
};

#endif
