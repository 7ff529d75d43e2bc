#include "messages/oeaccount.h"

#include "messages/oecurrency.h"

namespace {

// ---- BANKACCTFROM / BANKACCTTO ----
const OETagRow kBankAcctValid[] = {{OETAG_BANKID, OEVM_ALL, 0},      {OETAG_BRANCHID, OEVM_ALL, 0},
                                   {OETAG_ACCTID, OEVM_ALL, 0},      {OETAG_ACCTTYPE, OEVM_V1, 0},
                                   {OETAG_ACCTTYPE2, OEVM_NOTV1, 0}, {OETAG_ACCTKEY, OEVM_ALL, 0}};
// Each version requires exactly its own account-type element.
const OETagRow kBankAcctRequired[] = {{OETAG_BANKID, OEVM_ALL, 0},
                                      {OETAG_ACCTID, OEVM_ALL, 0},
                                      {OETAG_ACCTTYPE, OEVM_V1, 0},
                                      {OETAG_ACCTTYPE2, OEVM_NOTV1, 0}};
const OEFieldRow kBankAcctFields[] = {
    {OETAG_BANKID, OEFK_TEXT, OE_MEMBER(OEBankAccount, m_bankId), nullptr, nullptr},
    {OETAG_BRANCHID, OEFK_TEXT, OE_MEMBER(OEBankAccount, m_branchId), nullptr, nullptr},
    {OETAG_ACCTID, OEFK_TEXT, OE_MEMBER(OEBankAccount, m_acctId), nullptr, nullptr},
    {OETAG_ACCTTYPE, OEFK_ENUM, OE_MEMBER(OEBankAccount, m_acctType), &OEKW_BANKACCOUNTTYPE, nullptr},
    {OETAG_ACCTTYPE2, OEFK_ENUM, OE_MEMBER(OEBankAccount, m_acctType2), &OEKW_BANKACCOUNTTYPE2, nullptr},
    {OETAG_ACCTKEY, OEFK_TEXT, OE_MEMBER(OEBankAccount, m_acctKey), nullptr, nullptr},
};

// ---- CCACCTFROM / CCACCTTO ----
const OETagRow kCCAcctValid[] = {{OETAG_ACCTID, OEVM_ALL, 0}, {OETAG_ACCTKEY, OEVM_ALL, 0}};
const OETagRow kCCAcctRequired[] = {{OETAG_ACCTID, OEVM_ALL, 0}};
const OEFieldRow kCCAcctFields[] = {
    {OETAG_ACCTID, OEFK_TEXT, OE_MEMBER(OECCAccount, m_acctId), nullptr, nullptr},
    {OETAG_ACCTKEY, OEFK_TEXT, OE_MEMBER(OECCAccount, m_acctKey), nullptr, nullptr},
};

// ---- LEDGERBAL / AVAILBAL ----
const OETagRow kBankBalValid[] = {{OETAG_BALAMT, OEVM_ALL, 0}, {OETAG_DTASOF, OEVM_ALL, 0}};
const OEFieldRow kBankBalFields[] = {
    {OETAG_BALAMT, OEFK_AMOUNT, OE_MEMBER(OEBankBalance, m_balAmt), nullptr, nullptr},
    {OETAG_DTASOF, OEFK_DATETIME, OE_MEMBER(OEBankBalance, m_dtAsOf), nullptr, nullptr},
};

// ---- BAL ----
const OETagRow kBalValid[] = {
    {OETAG_VALUE, OEVM_ALL, 0},    {OETAG_NAME, OEVM_ALL, 0}, {OETAG_DTASOF, OEVM_ALL, 0},
    {OETAG_BALTYPE, OEVM_ALL, 0},  {OETAG_DESC, OEVM_ALL, 0}, {OETAG_LEDGERBAL, OEVM_ALL, 0},
    {OETAG_AVAILBAL, OEVM_ALL, 0}, {OETAG_BAL, OEVM_ALL, 0},  {OETAG_CURRENCY, OEVM_ALL, 0}};
const OETagRow kBalRequired[] = {{OETAG_VALUE, OEVM_ALL, 0},
                                 {OETAG_NAME, OEVM_ALL, 0},
                                 {OETAG_BALTYPE, OEVM_ALL, 0},
                                 {OETAG_DESC, OEVM_ALL, 0}};
const OEFieldRow kBalFields[] = {
    {OETAG_NAME, OEFK_TEXT, OE_MEMBER(OEBalance, m_name), nullptr, nullptr},
    {OETAG_DESC, OEFK_TEXT, OE_MEMBER(OEBalance, m_desc), nullptr, nullptr},
    {OETAG_BALTYPE, OEFK_ENUM, OE_MEMBER(OEBalance, m_balType), &OEKW_BALTYPE, nullptr},
    {OETAG_VALUE, OEFK_AMOUNT, OE_MEMBER(OEBalance, m_value), nullptr, nullptr},
    {OETAG_DTASOF, OEFK_DATETIME, OE_MEMBER(OEBalance, m_dtAsOf), nullptr, nullptr},
    {OETAG_CURRENCY, OEFK_CHILD, OE_MEMBER(OEBalance, m_currency), nullptr, OE_MAKE(NewCurrency)},
};

// ---- PAYEE / PAYEE2 ----
const OETagRow kPayeeValid[] = {
    {OETAG_NAME, OEVM_ALL, 0},       {OETAG_ADDR1, OEVM_ALL, 0},   {OETAG_ADDR2, OEVM_ALL, 0},
    {OETAG_ADDR3, OEVM_ALL, 0},      {OETAG_CITY, OEVM_ALL, 0},    {OETAG_STATE, OEVM_ALL, 0},
    {OETAG_POSTALCODE, OEVM_ALL, 0}, {OETAG_COUNTRY, OEVM_ALL, 0}, {OETAG_PHONE, OEVM_ALL, 0}};
const OETagRow kPayeeRequired[] = {{OETAG_NAME, OEVM_ALL, 0},       {OETAG_ADDR1, OEVM_ALL, 0},
                                   {OETAG_CITY, OEVM_ALL, 0},       {OETAG_STATE, OEVM_ALL, 0},
                                   {OETAG_POSTALCODE, OEVM_ALL, 0}, {OETAG_PHONE, OEVM_ALL, 0}};
const OETagRow kPayee2Required[] = {{OETAG_NAME, OEVM_ALL, 0}};
const OEFieldRow kPayeeFields[] = {
    {OETAG_NAME, OEFK_TEXT, OE_MEMBER(OEPayee, m_name), nullptr, nullptr},
    {OETAG_ADDR1, OEFK_TEXT, OE_MEMBER(OEPayee, m_addr1), nullptr, nullptr},
    {OETAG_ADDR2, OEFK_TEXT, OE_MEMBER(OEPayee, m_addr2), nullptr, nullptr},
    {OETAG_ADDR3, OEFK_TEXT, OE_MEMBER(OEPayee, m_addr3), nullptr, nullptr},
    {OETAG_CITY, OEFK_TEXT, OE_MEMBER(OEPayee, m_city), nullptr, nullptr},
    {OETAG_STATE, OEFK_TEXT, OE_MEMBER(OEPayee, m_state), nullptr, nullptr},
    {OETAG_POSTALCODE, OEFK_TEXT, OE_MEMBER(OEPayee, m_postalCode), nullptr, nullptr},
    {OETAG_COUNTRY, OEFK_TEXT, OE_MEMBER(OEPayee, m_country), nullptr, nullptr},
    {OETAG_PHONE, OEFK_TEXT, OE_MEMBER(OEPayee, m_phone), nullptr, nullptr},
};

const OEAggregateDesc kBankAcctDesc =
    OE_DESC(OETAG_BANKACCTFROM, kBankAcctValid, kBankAcctRequired, kBankAcctFields);
const OEAggregateDesc kCCAcctDesc = OE_DESC(OETAG_CCACCTFROM, kCCAcctValid, kCCAcctRequired, kCCAcctFields);
const OEAggregateDesc kBankBalDesc = OE_DESC(OETAG_LEDGERBAL, kBankBalValid, kBankBalValid, kBankBalFields);
const OEAggregateDesc kBalDesc = OE_DESC(OETAG_BAL, kBalValid, kBalRequired, kBalFields);
const OEAggregateDesc kPayeeDesc = OE_DESC(OETAG_PAYEE, kPayeeValid, kPayeeRequired, kPayeeFields);
const OEAggregateDesc kPayee2Desc = OE_DESC(OETAG_PAYEE2, kPayeeValid, kPayee2Required, kPayeeFields);

} // namespace

OEBankAccount::OEBankAccount(unsigned short version) : OEBankOrCCAccount(version) {
    SetType(OETAG_BANKACCTFROM);
}
const OEAggregateDesc& OEBankAccount::Describe() const {
    return kBankAcctDesc;
}

const char* OEBankAccount::GetAcctTypeText() const {
    if (ValidateTag(OETAG_ACCTTYPE) && m_acctType < OEKW_BANKACCOUNTTYPE.m_count)
        return OEKW_BANKACCOUNTTYPE.m_words[m_acctType];
    if (ValidateTag(OETAG_ACCTTYPE2) && m_acctType2 < OEKW_BANKACCOUNTTYPE2.m_count)
        return OEKW_BANKACCOUNTTYPE2.m_words[m_acctType2];
    return nullptr;
}

OECCAccount::OECCAccount(unsigned short version) : OEBankOrCCAccount(version) {
    SetType(OETAG_CCACCTFROM);
}
const OEAggregateDesc& OECCAccount::Describe() const {
    return kCCAcctDesc;
}

const OEAggregateDesc& OEBankBalance::Describe() const {
    return kBankBalDesc;
}

OEBalance::OEBalance(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_BAL);
}
const OEAggregateDesc& OEBalance::Describe() const {
    return kBalDesc;
}

OEPayee::OEPayee(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_PAYEE);
}
const OEAggregateDesc& OEPayee::Describe() const {
    return kPayeeDesc;
}

OEPayee2::OEPayee2(unsigned short version) : OEPayee(version) {
    SetType(OETAG_PAYEE2);
}
const OEAggregateDesc& OEPayee2::Describe() const {
    return kPayee2Desc;
}
