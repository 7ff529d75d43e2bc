#include "messages/oestmtend.h"

#include "messages/oecurrency.h"

namespace {

// ---- CLOSING / CCCLOSING ----
// The two closings open with the same six elements and end with the same five rows; what lies
// between is their own. (The table of a class lists every row, so the shared runs are macros.)
#define OE_CLOSING_HEAD_VALID                                                                                \
    {OETAG_FITID, OEVM_ALL, 0}, {OETAG_DTOPEN, OEVM_ALL, 0}, {OETAG_DTCLOSE, OEVM_ALL, 0},                   \
        {OETAG_DTNEXT, OEVM_ALL, 0}, {OETAG_BALOPEN, OEVM_ALL, 0}, {                                         \
        OETAG_BALCLOSE, OEVM_ALL, 0                                                                          \
    }
#define OE_CLOSING_TAIL_VALID                                                                                \
    {OETAG_DTPOSTSTART, OEVM_ALL, 0}, {OETAG_DTPOSTEND, OEVM_ALL, 0}, {OETAG_MKTGINFO, OEVM_ALL, 0},         \
        {OETAG_CURRENCY, OEVM_ALL, 0}, {                                                                     \
        OETAG_ORIGCURRENCY, OEVM_ALL, 0                                                                      \
    }
#define OE_CLOSING_HEAD_FIELDS(C)                                                                            \
    {OETAG_FITID, OEFK_TEXT, OE_MEMBER(C, m_fitId), nullptr, nullptr},                                       \
        {OETAG_DTOPEN, OEFK_DATETIME, OE_MEMBER(C, m_dtOpen), nullptr, nullptr},                             \
        {OETAG_DTCLOSE, OEFK_DATETIME, OE_MEMBER(C, m_dtClose), nullptr, nullptr},                           \
        {OETAG_DTNEXT, OEFK_DATETIME, OE_MEMBER(C, m_dtNext), nullptr, nullptr},                             \
        {OETAG_BALOPEN, OEFK_AMOUNT, OE_MEMBER(C, m_balOpen), nullptr, nullptr}, {                           \
        OETAG_BALCLOSE, OEFK_AMOUNT, OE_MEMBER(C, m_balClose), nullptr, nullptr                              \
    }
#define OE_CLOSING_TAIL_FIELDS(C)                                                                            \
    {OETAG_DTPOSTSTART, OEFK_DATETIME, OE_MEMBER(C, m_dtPostStart), nullptr, nullptr},                       \
        {OETAG_DTPOSTEND, OEFK_DATETIME, OE_MEMBER(C, m_dtPostEnd), nullptr, nullptr},                       \
        {OETAG_MKTGINFO, OEFK_TEXT, OE_MEMBER(C, m_mktgInfo), nullptr, nullptr},                             \
        {OETAG_CURRENCY, OEFK_CHILD, OE_MEMBER(C, m_currency), nullptr, OE_MAKE(NewCurrency)}, {             \
        OETAG_ORIGCURRENCY, OEFK_CHILD, OE_MEMBER(C, m_currency), nullptr, OE_MAKE(NewCurrency)              \
    }

const OETagRow kClosingRequired[] = {{OETAG_FITID, OEVM_ALL, 0},
                                     {OETAG_DTCLOSE, OEVM_ALL, 0},
                                     {OETAG_BALCLOSE, OEVM_ALL, 0},
                                     {OETAG_DTPOSTSTART, OEVM_ALL, 0},
                                     {OETAG_DTPOSTEND, OEVM_ALL, 0}};

const OETagRow kClosingValid[] = {
    OE_CLOSING_HEAD_VALID,          {OETAG_BALMIN, OEVM_ALL, 0},    {OETAG_DEPANDCREDIT, OEVM_ALL, 0},
    {OETAG_CHKANDDEB, OEVM_ALL, 0}, {OETAG_TOTALFEES, OEVM_ALL, 0}, {OETAG_TOTALINT, OEVM_ALL, 0},
    OE_CLOSING_TAIL_VALID};
const OEFieldRow kClosingFields[] = {
    OE_CLOSING_HEAD_FIELDS(OEClosing),
    {OETAG_BALMIN, OEFK_AMOUNT, OE_MEMBER(OEClosing, m_balMin), nullptr, nullptr},
    {OETAG_DEPANDCREDIT, OEFK_AMOUNT, OE_MEMBER(OEClosing, m_depAndCredit), nullptr, nullptr},
    {OETAG_CHKANDDEB, OEFK_AMOUNT, OE_MEMBER(OEClosing, m_chkAndDeb), nullptr, nullptr},
    {OETAG_TOTALFEES, OEFK_AMOUNT, OE_MEMBER(OEClosing, m_totalFees), nullptr, nullptr},
    {OETAG_TOTALINT, OEFK_AMOUNT, OE_MEMBER(OEClosing, m_totalInt), nullptr, nullptr},
    OE_CLOSING_TAIL_FIELDS(OEClosing),
};

const OETagRow kCCClosingValid[] = {
    OE_CLOSING_HEAD_VALID,       {OETAG_DTPMTDUE, OEVM_ALL, 0},     {OETAG_MINPMTDUE, OEVM_ALL, 0},
    {OETAG_FINCHG, OEVM_ALL, 0}, {OETAG_PAYANDCREDIT, OEVM_ALL, 0}, {OETAG_PURANDADV, OEVM_ALL, 0},
    {OETAG_DEBADJ, OEVM_ALL, 0}, {OETAG_CREDITLIMIT, OEVM_ALL, 0},  OE_CLOSING_TAIL_VALID};
const OEFieldRow kCCClosingFields[] = {
    OE_CLOSING_HEAD_FIELDS(OECCClosing),
    {OETAG_DTPMTDUE, OEFK_DATETIME, OE_MEMBER(OECCClosing, m_dtPmtDue), nullptr, nullptr},
    {OETAG_MINPMTDUE, OEFK_AMOUNT, OE_MEMBER(OECCClosing, m_minPmtDue), nullptr, nullptr},
    {OETAG_FINCHG, OEFK_AMOUNT, OE_MEMBER(OECCClosing, m_finChg), nullptr, nullptr},
    {OETAG_PAYANDCREDIT, OEFK_AMOUNT, OE_MEMBER(OECCClosing, m_payAndCredit), nullptr, nullptr},
    {OETAG_PURANDADV, OEFK_AMOUNT, OE_MEMBER(OECCClosing, m_purAndAdv), nullptr, nullptr},
    {OETAG_DEBADJ, OEFK_AMOUNT, OE_MEMBER(OECCClosing, m_debAdj), nullptr, nullptr},
    {OETAG_CREDITLIMIT, OEFK_AMOUNT, OE_MEMBER(OECCClosing, m_creditLimit), nullptr, nullptr},
    OE_CLOSING_TAIL_FIELDS(OECCClosing),
};

// ---- STMTENDRQ / CCSTMTENDRQ ----
const OETagRow kEndRqValid[] = {
    {OETAG_BANKACCTFROM, OEVM_ALL, 0}, {OETAG_DTSTART, OEVM_ALL, 0}, {OETAG_DTEND, OEVM_ALL, 0}};
const OETagRow kEndRqRequired[] = {{OETAG_BANKACCTFROM, OEVM_ALL, 0}};
const OEFieldRow kEndRqFields[] = {
    {OETAG_BANKACCTFROM, OEFK_CHILD, OE_MEMBER(OEStatementEndRq, m_account), nullptr,
     OE_MAKE(NewBankAccount)},
    {OETAG_DTSTART, OEFK_DATETIME, OE_MEMBER(OEStatementEndRq, m_dtStart), nullptr, nullptr},
    {OETAG_DTEND, OEFK_DATETIME, OE_MEMBER(OEStatementEndRq, m_dtEnd), nullptr, nullptr},
};
const OETagRow kCCEndRqValid[] = {
    {OETAG_CCACCTFROM, OEVM_ALL, 0}, {OETAG_DTSTART, OEVM_ALL, 0}, {OETAG_DTEND, OEVM_ALL, 0}};
const OETagRow kCCEndRqRequired[] = {{OETAG_CCACCTFROM, OEVM_ALL, 0}};
const OEFieldRow kCCEndRqFields[] = {
    {OETAG_CCACCTFROM, OEFK_CHILD, OE_MEMBER(OECCStatementEndRq, m_account), nullptr, OE_MAKE(NewCCAccount)},
    {OETAG_DTSTART, OEFK_DATETIME, OE_MEMBER(OECCStatementEndRq, m_dtStart), nullptr, nullptr},
    {OETAG_DTEND, OEFK_DATETIME, OE_MEMBER(OECCStatementEndRq, m_dtEnd), nullptr, nullptr},
};

// ---- STMTENDRS / CCSTMTENDRS ----
const OETagRow kEndRsValid[] = {
    {OETAG_CURDEF, OEVM_ALL, 0}, {OETAG_BANKACCTFROM, OEVM_ALL, 0}, {OETAG_CLOSING, OEVM_ALL, 0}};
const OETagRow kEndRsRequired[] = {{OETAG_CURDEF, OEVM_ALL, 0}, {OETAG_BANKACCTFROM, OEVM_ALL, 0}};
const OEFieldRow kEndRsFields[] = {
    {OETAG_CURDEF, OEFK_TEXT, OE_MEMBER(OEStatementEndRs, m_curDef), nullptr, nullptr},
    {OETAG_BANKACCTFROM, OEFK_CHILD, OE_MEMBER(OEStatementEndRs, m_account), nullptr,
     OE_MAKE(NewBankAccount)},
    {OETAG_CLOSING, OEFK_LIST, OE_MEMBER(OEStatementEndRs, m_closings), nullptr, OE_MAKE(NewClosing)},
};
const OETagRow kCCEndRsValid[] = {
    {OETAG_CURDEF, OEVM_ALL, 0}, {OETAG_CCACCTFROM, OEVM_ALL, 0}, {OETAG_CCCLOSING, OEVM_ALL, 0}};
const OETagRow kCCEndRsRequired[] = {{OETAG_CURDEF, OEVM_ALL, 0}, {OETAG_CCACCTFROM, OEVM_ALL, 0}};
const OEFieldRow kCCEndRsFields[] = {
    {OETAG_CURDEF, OEFK_TEXT, OE_MEMBER(OECCStatementEndRs, m_curDef), nullptr, nullptr},
    {OETAG_CCACCTFROM, OEFK_CHILD, OE_MEMBER(OECCStatementEndRs, m_account), nullptr, OE_MAKE(NewCCAccount)},
    {OETAG_CCCLOSING, OEFK_LIST, OE_MEMBER(OECCStatementEndRs, m_closings), nullptr, OE_MAKE(NewCCClosing)},
};

const OEAggregateDesc kClosingDesc = OE_DESC(OETAG_CLOSING, kClosingValid, kClosingRequired, kClosingFields);
const OEAggregateDesc kCCClosingDesc =
    OE_DESC(OETAG_CCCLOSING, kCCClosingValid, kClosingRequired, kCCClosingFields);
const OEAggregateDesc kEndRqDesc = OE_DESC(OETAG_STMTENDRQ, kEndRqValid, kEndRqRequired, kEndRqFields);
const OEAggregateDesc kCCEndRqDesc =
    OE_DESC(OETAG_CCSTMTENDRQ, kCCEndRqValid, kCCEndRqRequired, kCCEndRqFields);
const OEAggregateDesc kEndRsDesc = OE_DESC(OETAG_STMTENDRS, kEndRsValid, kEndRsRequired, kEndRsFields);
const OEAggregateDesc kCCEndRsDesc =
    OE_DESC(OETAG_CCSTMTENDRS, kCCEndRsValid, kCCEndRsRequired, kCCEndRsFields);

} // namespace

unsigned short OEClosingBase::SetCurrency(OEDataObj* currency) {
    if (!currency) return SetChildObj(OETAG_CURRENCY, nullptr);
    return SetChildObj(currency->GetType() == OETAG_ORIGCURRENCY ? OETAG_ORIGCURRENCY : OETAG_CURRENCY,
                       currency);
}

OEClosing::OEClosing(unsigned short version) : OEClosingBase(version) {
    SetType(OETAG_CLOSING);
}
const OEAggregateDesc& OEClosing::Describe() const {
    return kClosingDesc;
}

OECCClosing::OECCClosing(unsigned short version) : OEClosingBase(version) {
    SetType(OETAG_CCCLOSING);
}
const OEAggregateDesc& OECCClosing::Describe() const {
    return kCCClosingDesc;
}

OEStatementEndRq::OEStatementEndRq(unsigned short version) : OEAccountFromOf(version) {
    SetType(OETAG_STMTENDRQ);
}
const OEAggregateDesc& OEStatementEndRq::Describe() const {
    return kEndRqDesc;
}

OECCStatementEndRq::OECCStatementEndRq(unsigned short version) : OEAccountFromOf(version) {
    SetType(OETAG_CCSTMTENDRQ);
}
const OEAggregateDesc& OECCStatementEndRq::Describe() const {
    return kCCEndRqDesc;
}

void OEStatementEndRsBase::DeleteAllClosing() {
    m_closings.DeleteAll();
    // The closings' tag is the one of the list row (CLOSING or CCCLOSING).
    const OEAggregateDesc& d = Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i)
        if (d.m_fields[i].m_kind == OEFK_LIST && ValidateTag(d.m_fields[i].m_tag))
            ClearTag(d.m_fields[i].m_tag);
}

OEStatementEndRs::OEStatementEndRs(unsigned short version) : OEAccountFromOf(version) {
    SetType(OETAG_STMTENDRS);
}
const OEAggregateDesc& OEStatementEndRs::Describe() const {
    return kEndRsDesc;
}

OECCStatementEndRs::OECCStatementEndRs(unsigned short version) : OEAccountFromOf(version) {
    SetType(OETAG_CCSTMTENDRS);
}
const OEAggregateDesc& OECCStatementEndRs::Describe() const {
    return kCCEndRsDesc;
}
