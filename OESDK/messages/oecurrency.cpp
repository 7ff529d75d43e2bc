#include "messages/oecurrency.h"

namespace {

const OETagRow kCurrencyValid[] = {{OETAG_CURRATE, OEVM_ALL, 0}, {OETAG_CURSYM, OEVM_ALL, 0}};
const OEFieldRow kCurrencyFields[] = {
    {OETAG_CURRATE, OEFK_AMOUNT, OE_MEMBER(OECurrency, m_curRate), nullptr, nullptr},
    {OETAG_CURSYM, OEFK_TEXT, OE_MEMBER(OECurrency, m_curSym), nullptr, nullptr},
};
const OEAggregateDesc kCurrencyDesc =
    OE_DESC(OETAG_CURRENCY, kCurrencyValid, kCurrencyValid, kCurrencyFields);

} // namespace

OECurrency::OECurrency(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_CURRENCY);
}
const OEAggregateDesc& OECurrency::Describe() const {
    return kCurrencyDesc;
}
