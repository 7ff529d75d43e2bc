#include "messages/oebank.h"

#include "foundation/oeparsewarning.h"
#include "foundation/oethread.h"
#include "messages/oecurrency.h"

namespace {

// ---- STMTTRN ----
const OETagRow kTxValid[] = {
    {OETAG_TRNTYPE, OEVM_ALL, 0},      {OETAG_DTPOSTED, OEVM_ALL, 0},      {OETAG_DTUSER, OEVM_ALL, 0},
    {OETAG_DTAVAIL, OEVM_ALL, 0},      {OETAG_TRNAMT, OEVM_ALL, 0},        {OETAG_FITID, OEVM_ALL, 0},
    {OETAG_CORRECTFITID, OEVM_ALL, 0}, {OETAG_CORRECTACTION, OEVM_ALL, 0}, {OETAG_SRVRTID, OEVM_V1, 0},
    {OETAG_SRVRTID2, OEVM_NOTV1, 0},   {OETAG_CHECKNUM, OEVM_ALL, 0},      {OETAG_REFNUM, OEVM_ALL, 0},
    {OETAG_SIC, OEVM_ALL, 0},          {OETAG_PAYEEID, OEVM_V1, 0},        {OETAG_PAYEEID2, OEVM_NOTV1, 0},
    {OETAG_NAME, OEVM_ALL, 0},         {OETAG_PAYEE, OEVM_V1, 0},          {OETAG_PAYEE2, OEVM_NOTV1, 0},
    {OETAG_BANKACCTTO, OEVM_ALL, 0},   {OETAG_CCACCTTO, OEVM_ALL, 0},      {OETAG_MEMO, OEVM_V1, 0},
    {OETAG_MEMO2, OEVM_NOTV1, 0},      {OETAG_CURRENCY, OEVM_ALL, 0},      {OETAG_ORIGCURRENCY, OEVM_ALL, 0},
    {OETAG_STMTTRN, OEVM_ALL, 0}};
const OETagRow kTxRequired[] = {{OETAG_TRNTYPE, OEVM_ALL, 0},
                                {OETAG_DTPOSTED, OEVM_ALL, 0},
                                {OETAG_TRNAMT, OEVM_ALL, 0},
                                {OETAG_FITID, OEVM_ALL, 0}};
// Build order: elements, the payee, the destination account, the memos, and last the currency.
const OEFieldRow kTxFields[] = {
    {OETAG_TRNTYPE, OEFK_ENUM, OE_MEMBER(OEBankStatementTx, m_trnType), &OEKW_BANKTXTYPE, nullptr},
    {OETAG_DTPOSTED, OEFK_DATETIME, OE_MEMBER(OEBankStatementTx, m_dtPosted), nullptr, nullptr},
    {OETAG_DTUSER, OEFK_DATETIME, OE_MEMBER(OEBankStatementTx, m_dtUser), nullptr, nullptr},
    {OETAG_DTAVAIL, OEFK_DATETIME, OE_MEMBER(OEBankStatementTx, m_dtAvail), nullptr, nullptr},
    {OETAG_TRNAMT, OEFK_AMOUNT, OE_MEMBER(OEBankStatementTx, m_trnAmt), nullptr, nullptr},
    {OETAG_FITID, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_fitId), nullptr, nullptr},
    {OETAG_CORRECTFITID, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_correctFitId), nullptr, nullptr},
    {OETAG_CORRECTACTION, OEFK_ENUM, OE_MEMBER(OEBankStatementTx, m_correctAction), &OEKW_CORRECTACTION,
     nullptr},
    {OETAG_SRVRTID, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_srvrTid), nullptr, nullptr},
    {OETAG_SRVRTID2, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_srvrTid2), nullptr, nullptr},
    {OETAG_CHECKNUM, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_checkNum), nullptr, nullptr},
    {OETAG_REFNUM, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_refNum), nullptr, nullptr},
    {OETAG_SIC, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_sic), nullptr, nullptr},
    {OETAG_PAYEEID, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_payeeId), nullptr, nullptr},
    {OETAG_PAYEEID2, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_payeeId2), nullptr, nullptr},
    {OETAG_NAME, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_name), nullptr, nullptr},
    {OETAG_PAYEE, OEFK_CHILD, OE_MEMBER(OEBankStatementTx, m_payee), nullptr, OE_MAKE(NewPayee)},
    {OETAG_PAYEE2, OEFK_CHILD, OE_MEMBER(OEBankStatementTx, m_payee), nullptr, OE_MAKE(NewPayee2)},
    {OETAG_BANKACCTTO, OEFK_CHILD, OE_MEMBER(OEBankStatementTx, m_accountTo), nullptr,
     OE_MAKE(NewBankAccount)},
    {OETAG_CCACCTTO, OEFK_CHILD, OE_MEMBER(OEBankStatementTx, m_accountTo), nullptr, OE_MAKE(NewCCAccount)},
    {OETAG_MEMO, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_memo), nullptr, nullptr},
    {OETAG_MEMO2, OEFK_TEXT, OE_MEMBER(OEBankStatementTx, m_memo2), nullptr, nullptr},
    {OETAG_CURRENCY, OEFK_CHILD, OE_MEMBER(OEBankStatementTx, m_currency), nullptr, OE_MAKE(NewCurrency)},
    {OETAG_ORIGCURRENCY, OEFK_CHILD, OE_MEMBER(OEBankStatementTx, m_currency), nullptr, OE_MAKE(NewCurrency)},
};

// ---- BANKTRANLIST ----
const OETagRow kListValid[] = {
    {OETAG_DTSTART, OEVM_ALL, 0}, {OETAG_DTEND, OEVM_ALL, 0}, {OETAG_STMTTRN, OEVM_ALL, 0}};
const OETagRow kListRequired[] = {{OETAG_DTSTART, OEVM_ALL, 0}, {OETAG_DTEND, OEVM_ALL, 0}};
const OEFieldRow kListFields[] = {
    {OETAG_DTSTART, OEFK_DATETIME, OE_MEMBER(OEBankTransactionList, m_dtStart), nullptr, nullptr},
    {OETAG_DTEND, OEFK_DATETIME, OE_MEMBER(OEBankTransactionList, m_dtEnd), nullptr, nullptr},
    {OETAG_STMTTRN, OEFK_LIST, OE_MEMBER(OEBankTransactionList, m_tx), nullptr, OE_MAKE(NewBankStatementTx)},
};

// ---- INCTRAN ----
const OETagRow kIncValid[] = {
    {OETAG_DTSTART, OEVM_ALL, 0}, {OETAG_DTEND, OEVM_ALL, 0}, {OETAG_INCLUDE, OEVM_ALL, 0}};
const OETagRow kIncRequired[] = {{OETAG_INCLUDE, OEVM_ALL, 0}};
const OEFieldRow kIncFields[] = {
    {OETAG_DTSTART, OEFK_DATETIME, OE_MEMBER(OEIncTransaction, m_dtStart), nullptr, nullptr},
    {OETAG_DTEND, OEFK_DATETIME, OE_MEMBER(OEIncTransaction, m_dtEnd), nullptr, nullptr},
    {OETAG_INCLUDE, OEFK_BOOL, OE_MEMBER(OEIncTransaction, m_include), nullptr, nullptr},
};

// ---- STMTRS ----
const OETagRow kStmtRsValid[] = {{OETAG_CURDEF, OEVM_ALL, 0},       {OETAG_BANKACCTFROM, OEVM_ALL, 0},
                                 {OETAG_LEDGERBAL, OEVM_ALL, 0},    {OETAG_AVAILBAL, OEVM_ALL, 0},
                                 {OETAG_BANKTRANLIST, OEVM_ALL, 0}, {OETAG_MKTGINFO, OEVM_ALL, 0}};
const OETagRow kStmtRsRequired[] = {
    {OETAG_CURDEF, OEVM_ALL, 0}, {OETAG_BANKACCTFROM, OEVM_ALL, 0}, {OETAG_LEDGERBAL, OEVM_ALL, 0}};
const OEFieldRow kStmtRsFields[] = {
    {OETAG_CURDEF, OEFK_TEXT, OE_MEMBER(OEBankStatementRs, m_curDef), nullptr, nullptr},
    {OETAG_BANKACCTFROM, OEFK_CHILD, OE_MEMBER(OEBankStatementRs, m_account), nullptr,
     OE_MAKE(NewBankAccount)},
    {OETAG_BANKTRANLIST, OEFK_CHILD, OE_MEMBER(OEBankStatementRs, m_tranList), nullptr,
     OE_MAKE(NewBankTransactionList)},
    {OETAG_LEDGERBAL, OEFK_CHILD, OE_MEMBER(OEBankStatementRs, m_ledgerBal), nullptr,
     OE_MAKE(NewLedgerBalance)},
    {OETAG_AVAILBAL, OEFK_CHILD, OE_MEMBER(OEBankStatementRs, m_availBal), nullptr,
     OE_MAKE(NewAvailableBalance)},
    {OETAG_MKTGINFO, OEFK_TEXT, OE_MEMBER(OEBankStatementRs, m_mktgInfo), nullptr, nullptr},
};

// ---- CCSTMTRS ----
const OETagRow kCCStmtRsValid[] = {{OETAG_CURDEF, OEVM_ALL, 0},       {OETAG_CCACCTFROM, OEVM_ALL, 0},
                                   {OETAG_LEDGERBAL, OEVM_ALL, 0},    {OETAG_AVAILBAL, OEVM_ALL, 0},
                                   {OETAG_BANKTRANLIST, OEVM_ALL, 0}, {OETAG_MKTGINFO, OEVM_ALL, 0}};
const OETagRow kCCStmtRsRequired[] = {
    {OETAG_CURDEF, OEVM_ALL, 0}, {OETAG_CCACCTFROM, OEVM_ALL, 0}, {OETAG_LEDGERBAL, OEVM_ALL, 0}};
const OEFieldRow kCCStmtRsFields[] = {
    {OETAG_CURDEF, OEFK_TEXT, OE_MEMBER(OECCStatementRs, m_curDef), nullptr, nullptr},
    {OETAG_CCACCTFROM, OEFK_CHILD, OE_MEMBER(OECCStatementRs, m_account), nullptr, OE_MAKE(NewCCAccount)},
    {OETAG_BANKTRANLIST, OEFK_CHILD, OE_MEMBER(OECCStatementRs, m_tranList), nullptr,
     OE_MAKE(NewBankTransactionList)},
    {OETAG_LEDGERBAL, OEFK_CHILD, OE_MEMBER(OECCStatementRs, m_ledgerBal), nullptr,
     OE_MAKE(NewLedgerBalance)},
    {OETAG_AVAILBAL, OEFK_CHILD, OE_MEMBER(OECCStatementRs, m_availBal), nullptr,
     OE_MAKE(NewAvailableBalance)},
    {OETAG_MKTGINFO, OEFK_TEXT, OE_MEMBER(OECCStatementRs, m_mktgInfo), nullptr, nullptr},
};

// ---- STMTRQ / CCSTMTRQ ----
const OETagRow kStmtRqValid[] = {{OETAG_BANKACCTFROM, OEVM_ALL, 0}, {OETAG_INCTRAN, OEVM_ALL, 0}};
const OETagRow kStmtRqRequired[] = {{OETAG_BANKACCTFROM, OEVM_ALL, 0}};
const OEFieldRow kStmtRqFields[] = {
    {OETAG_BANKACCTFROM, OEFK_CHILD, OE_MEMBER(OEBankStatementRq, m_account), nullptr,
     OE_MAKE(NewBankAccount)},
    {OETAG_INCTRAN, OEFK_CHILD, OE_MEMBER(OEBankStatementRq, m_incTran), nullptr, OE_MAKE(NewIncTransaction)},
};
const OETagRow kCCStmtRqValid[] = {{OETAG_CCACCTFROM, OEVM_ALL, 0}, {OETAG_INCTRAN, OEVM_ALL, 0}};
const OETagRow kCCStmtRqRequired[] = {{OETAG_CCACCTFROM, OEVM_ALL, 0}};
const OEFieldRow kCCStmtRqFields[] = {
    {OETAG_CCACCTFROM, OEFK_CHILD, OE_MEMBER(OECCStatementRq, m_account), nullptr, OE_MAKE(NewCCAccount)},
    {OETAG_INCTRAN, OEFK_CHILD, OE_MEMBER(OECCStatementRq, m_incTran), nullptr, OE_MAKE(NewIncTransaction)},
};

const OEAggregateDesc kTxDesc = OE_DESC(OETAG_STMTTRN, kTxValid, kTxRequired, kTxFields);
const OEAggregateDesc kListDesc = OE_DESC(OETAG_BANKTRANLIST, kListValid, kListRequired, kListFields);
const OEAggregateDesc kIncDesc = OE_DESC(OETAG_INCTRAN, kIncValid, kIncRequired, kIncFields);
const OEAggregateDesc kStmtRsDesc = OE_DESC(OETAG_STMTRS, kStmtRsValid, kStmtRsRequired, kStmtRsFields);
const OEAggregateDesc kCCStmtRsDesc =
    OE_DESC(OETAG_CCSTMTRS, kCCStmtRsValid, kCCStmtRsRequired, kCCStmtRsFields);
const OEAggregateDesc kStmtRqDesc = OE_DESC(OETAG_STMTRQ, kStmtRqValid, kStmtRqRequired, kStmtRqFields);
const OEAggregateDesc kCCStmtRqDesc =
    OE_DESC(OETAG_CCSTMTRQ, kCCStmtRqValid, kCCStmtRqRequired, kCCStmtRqFields);

} // namespace

// ---------------------------------------------------------------- STMTTRN

OEBankStatementTx::OEBankStatementTx(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_STMTTRN);
}
const OEAggregateDesc& OEBankStatementTx::Describe() const {
    return kTxDesc;
}

const char* OEBankStatementTx::GetTxTypeText() const {
    return ValidateTag(OETAG_TRNTYPE) && m_trnType < OEKW_BANKTXTYPE.m_count
               ? OEKW_BANKTXTYPE.m_words[m_trnType]
               : nullptr;
}

unsigned short OEBankStatementTx::AllRequiredPresent() {
    if (!OEAggregate::AllRequiredPresent()) return 0;
    int names = (ValidateTag(OETAG_NAME) ? 1 : 0) + (ValidateTag(OETAG_PAYEE) ? 1 : 0) +
                (ValidateTag(OETAG_PAYEE2) ? 1 : 0);
    if (names > 1) return 0;
    if (ValidateTag(OETAG_BANKACCTTO) && ValidateTag(OETAG_CCACCTTO)) return 0;
    return 1;
}

unsigned short OEBankStatementTx::SetAccountTo(OEBankOrCCAccount* account) {
    if (!account) return SetChildObj(OETAG_BANKACCTTO, nullptr);
    account->NewAcctTo();
    return SetChildObj(account->GetType(), account);
}

unsigned short OEBankStatementTx::SetCurrency(OEDataObj* currency) {
    if (!currency) return SetChildObj(OETAG_CURRENCY, nullptr);
    return SetChildObj(currency->GetType() == OETAG_ORIGCURRENCY ? OETAG_ORIGCURRENCY : OETAG_CURRENCY,
                       currency);
}

// ---------------------------------------------------------------- BANKTRANLIST

OEBankTransactionList::OEBankTransactionList(unsigned short version) : OEDateRangeOf(version), m_tx(16, 512) {
    SetType(OETAG_BANKTRANLIST);
}
const OEAggregateDesc& OEBankTransactionList::Describe() const {
    return kListDesc;
}

unsigned short OEBankTransactionList::SetStatementTx(unsigned short index, OEBankStatementTx* tx) {
    if (!tx || index > m_tx.Entries()) return 0;
    if (index == m_tx.Entries()) return AppendStatementTx(tx);
    if (!m_tx.Set(index, tx)) return 0;
    if (GetMsgSetVersion() && !tx->GetMsgSetVersion()) tx->SetMsgSetVersion(GetMsgSetVersion());
    return SetTag(OETAG_STMTTRN);
}

void OEBankTransactionList::ClearStatementTx() {
    m_tx.DisconnectAll();
    ClearTag(OETAG_STMTTRN);
}

void OEBankTransactionList::DeleteAllStatementTx() {
    m_tx.DeleteAll();
    ClearTag(OETAG_STMTTRN);
}

// ---------------------------------------------------------------- INCTRAN

OEIncTransaction::OEIncTransaction(unsigned short version) : OEDateRangeOf(version) {
    SetType(OETAG_INCTRAN);
}
const OEAggregateDesc& OEIncTransaction::Describe() const {
    return kIncDesc;
}

// ---------------------------------------------------------------- STMTRS / CCSTMTRS

OEBankStatementRs::OEBankStatementRs(unsigned short version) : OEAccountFromOf(version) {
    SetType(OETAG_STMTRS);
}
const OEAggregateDesc& OEBankStatementRs::Describe() const {
    return kStmtRsDesc;
}

OECCStatementRs::OECCStatementRs(unsigned short version) : OEAccountFromOf(version) {
    SetType(OETAG_CCSTMTRS);
}
const OEAggregateDesc& OECCStatementRs::Describe() const {
    return kCCStmtRsDesc;
}

// ---------------------------------------------------------------- STMTRQ / CCSTMTRQ

OEParseStatus OEGenericStatementRq::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry) return OEPS_INVALID;
    const OEFieldRow* row = FindRow(entry->m_id);
    if (!row || row->m_kind != OEFK_CHILD) return OEPS_INVALID;
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    if (GetChildObj(entry->m_id)) {
        OELogParseWarning(OEPW_EXTRAAGG, "", "", entry->m_id, this);
        SetChildObj(entry->m_id, nullptr);
    }
    // Made with version 0, so the factory's own version applies until the push passes ours.
    OEDataObj* child = row->m_make(factory, 0);
    if (!child) {
        OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
        return OEPS_NORESOURCE;
    }
    *static_cast<OEDataObj**>(Slot(row)) = child;
    return PushAndSetObject(child, entry->m_id);
}

OEBankStatementRq::OEBankStatementRq(unsigned short version) : OEAccountFromOf(version) {
    SetType(OETAG_STMTRQ);
}
const OEAggregateDesc& OEBankStatementRq::Describe() const {
    return kStmtRqDesc;
}

OECCStatementRq::OECCStatementRq(unsigned short version) : OEAccountFromOf(version) {
    SetType(OETAG_CCSTMTRQ);
}
const OEAggregateDesc& OECCStatementRq::Describe() const {
    return kCCStmtRqDesc;
}
