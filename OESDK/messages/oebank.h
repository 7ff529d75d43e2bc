// Bank and credit-card statements: STMTTRN, BANKTRANLIST, INCTRAN, STMTRQ/STMTRS and
// CCSTMTRQ/CCSTMTRS.
#ifndef OESDK_MESSAGES_OEBANK_H
#define OESDK_MESSAGES_OEBANK_H
#include "messages/oeaccount.h"
#include "messages/oetrans.h"

// STMTTRN: one statement transaction.
class OE_API OEBankStatementTx : public OEAggregate {
public:
    explicit OEBankStatementTx(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // At most one of NAME, PAYEE, PAYEE2 and at most one of BANKACCTTO, CCACCTTO.
    unsigned short AllRequiredPresent() override;

    // TRNTYPE as an index of OEKW_BANKTXTYPE.
    unsigned short GetTxType() const { return static_cast<unsigned short>(GetNumber(OETAG_TRNTYPE)); }
    const char* GetTxTypeText() const;
    unsigned short SetTxType(const OEString& v) { return SetFromText(OETAG_TRNTYPE, v); }
    unsigned short SetTxType(unsigned short v) { return SetNumber(OETAG_TRNTYPE, v); }
    const OEDateTime* GetDateTimePosted() const { return GetDateTime(OETAG_DTPOSTED); }
    unsigned short SetDateTimePosted(const OEString& v) { return SetFromText(OETAG_DTPOSTED, v); }
    unsigned short SetDateTimePosted(const OEDateTime& v) { return SetDateTime(OETAG_DTPOSTED, v); }
    const OEDateTime* GetDateTimeUser() const { return GetDateTime(OETAG_DTUSER); }
    unsigned short SetDateTimeUser(const OEString& v) { return SetFromText(OETAG_DTUSER, v); }
    unsigned short SetDateTimeUser(const OEDateTime& v) { return SetDateTime(OETAG_DTUSER, v); }
    const OEDateTime* GetDateTimeAvailable() const { return GetDateTime(OETAG_DTAVAIL); }
    unsigned short SetDateTimeAvailable(const OEString& v) { return SetFromText(OETAG_DTAVAIL, v); }
    unsigned short SetDateTimeAvailable(const OEDateTime& v) { return SetDateTime(OETAG_DTAVAIL, v); }
    const OEPrecisionInteger* GetTxAmount() const { return GetAmount(OETAG_TRNAMT); }
    unsigned short SetTxAmount(const OEString& v) { return SetFromText(OETAG_TRNAMT, v); }
    unsigned short SetTxAmount(const OEPrecisionInteger& v) { return SetAmount(OETAG_TRNAMT, v); }
    const OEString* GetFITId() const { return GetText(OETAG_FITID); }
    unsigned short SetFITId(const OEString& v) { return SetFromText(OETAG_FITID, v); }
    const OEString* GetCorrectedFITId() const { return GetText(OETAG_CORRECTFITID); }
    unsigned short SetCorrectedFITId(const OEString& v) { return SetFromText(OETAG_CORRECTFITID, v); }
    unsigned short GetCorrectAction() const {
        return static_cast<unsigned short>(GetNumber(OETAG_CORRECTACTION));
    }
    unsigned short SetCorrectAction(const OEString& v) { return SetFromText(OETAG_CORRECTACTION, v); }
    unsigned short SetCorrectAction(unsigned short v) { return SetNumber(OETAG_CORRECTACTION, v); }
    const OEString* GetServerTxId() const { return GetText(OETAG_SRVRTID); }
    unsigned short SetServerTxId(const OEString& v) { return SetFromText(OETAG_SRVRTID, v); }
    const OEString* GetServerTxId2() const { return GetText(OETAG_SRVRTID2); }
    unsigned short SetServerTxId2(const OEString& v) { return SetFromText(OETAG_SRVRTID2, v); }
    const OEString* GetCheckNum() const { return GetText(OETAG_CHECKNUM); }
    unsigned short SetCheckNum(const OEString& v) { return SetFromText(OETAG_CHECKNUM, v); }
    const OEString* GetReferenceNum() const { return GetText(OETAG_REFNUM); }
    unsigned short SetReferenceNum(const OEString& v) { return SetFromText(OETAG_REFNUM, v); }
    const OEString* GetSIC() const { return GetText(OETAG_SIC); }
    unsigned short SetSIC(const OEString& v) { return SetFromText(OETAG_SIC, v); }
    const OEString* GetPayeeId() const { return GetText(OETAG_PAYEEID); }
    unsigned short SetPayeeId(const OEString& v) { return SetFromText(OETAG_PAYEEID, v); }
    const OEString* GetPayeeId2() const { return GetText(OETAG_PAYEEID2); }
    unsigned short SetPayeeId2(const OEString& v) { return SetFromText(OETAG_PAYEEID2, v); }
    const OEString* GetName() const { return GetText(OETAG_NAME); }
    unsigned short SetName(const OEString& v) { return SetFromText(OETAG_NAME, v); }
    const OEString* GetMemo() const { return GetText(OETAG_MEMO); }
    unsigned short SetMemo(const OEString& v) { return SetFromText(OETAG_MEMO, v); }
    const OEString* GetMemo2() const { return GetText(OETAG_MEMO2); }
    unsigned short SetMemo2(const OEString& v) { return SetFromText(OETAG_MEMO2, v); }
    // PAYEE and PAYEE2 share one member, as BANKACCTTO and CCACCTTO do, and CURRENCY and
    // ORIGCURRENCY.
    OEPayee* GetPayee() const { return static_cast<OEPayee*>(m_payee.get()); }
    unsigned short SetPayee(OEPayee* payee) { return SetChildObj(OETAG_PAYEE, payee); }
    unsigned short SetPayee2(OEPayee2* payee) { return SetChildObj(OETAG_PAYEE2, payee); }
    OEBankOrCCAccount* GetAccountTo() const { return static_cast<OEBankOrCCAccount*>(m_accountTo.get()); }
    unsigned short SetAccountTo(OEBankOrCCAccount* account);
    OEDataObj* GetCurrency() const { return m_currency.get(); }
    unsigned short SetCurrency(OEDataObj* currency);

    OEDateTime m_dtPosted, m_dtUser, m_dtAvail;
    unsigned short m_trnType = 0;
    OEPrecisionInteger m_trnAmt;
    OEOwnedChild m_currency;
    OEString255 m_fitId, m_correctFitId;
    OEString36 m_srvrTid, m_srvrTid2;
    OEString12 m_checkNum;
    OEString32 m_refNum;
    OEString12 m_payeeId;
    OEString36 m_payeeId2;
    unsigned short m_correctAction = 0;
    OEString32 m_name;
    OEString255 m_memo;
    OEBoundedString<390> m_memo2;
    OEOwnedChild m_payee;
    OEBoundedString<6> m_sic;
    OEOwnedChild m_accountTo;
};

// The DTSTART / DTEND pair of a transaction list, of INCTRAN and of the statement-end requests,
// over the class Base.
template <class Base> class OEDateRangeOf : public Base {
public:
    explicit OEDateRangeOf(unsigned short version = 0) : Base(version) {}
    const OEDateTime* GetDateStart() const { return this->GetDateTime(OETAG_DTSTART); }
    unsigned short SetDateStart(const OEString& v) { return this->SetFromText(OETAG_DTSTART, v); }
    unsigned short SetDateStart(const OEDateTime& v) { return this->SetDateTime(OETAG_DTSTART, v); }
    const OEDateTime* GetDateEnd() const { return this->GetDateTime(OETAG_DTEND); }
    unsigned short SetDateEnd(const OEString& v) { return this->SetFromText(OETAG_DTEND, v); }
    unsigned short SetDateEnd(const OEDateTime& v) { return this->SetDateTime(OETAG_DTEND, v); }

    OEDateTime m_dtStart, m_dtEnd;
};

// BANKTRANLIST: DTSTART, DTEND and the transactions in order.
class OE_API OEBankTransactionList : public OEDateRangeOf<OEAggregate> {
public:
    explicit OEBankTransactionList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AppendStatementTx(OEBankStatementTx* tx) { return AppendToList(OETAG_STMTTRN, tx); }
    // Replaces the entry at index (index equal to the count appends); the old one is deleted.
    unsigned short SetStatementTx(unsigned short index, OEBankStatementTx* tx);
    OEBankStatementTx* GetStatementTx(unsigned short index) const {
        return static_cast<OEBankStatementTx*>(m_tx.Get(index));
    }
    unsigned short GetNumStatementTx() const { return m_tx.Entries(); }
    // Forgets every entry without deleting any (the caller keeps them).
    void ClearStatementTx();
    void DeleteAllStatementTx();

    OEDataObjList m_tx;
};

// INCTRAN: DTSTART, DTEND, INCLUDE (required).
class OE_API OEIncTransaction : public OEDateRangeOf<OEAggregate> {
public:
    explicit OEIncTransaction(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short GetInclude() const { return static_cast<unsigned short>(GetNumber(OETAG_INCLUDE)); }
    unsigned short SetInclude(const OEString& v) { return SetFromText(OETAG_INCLUDE, v); }
    unsigned short SetInclude(unsigned short v) { return SetNumber(OETAG_INCLUDE, v); }

    unsigned short m_include = 0;
};

// The base of the statement responses: everything but the account, which each names itself.
class OE_API OEGenericStatementRs : public OETransBase {
public:
    explicit OEGenericStatementRs(unsigned short version = 0) : OETransBase(version) {}
    const OEString* GetCurDef() const { return GetText(OETAG_CURDEF); }
    unsigned short SetCurDef(const OEString& v) { return SetFromText(OETAG_CURDEF, v); }
    const OEString* GetMktgInfo() const { return GetText(OETAG_MKTGINFO); }
    unsigned short SetMktgInfo(const OEString& v) { return SetFromText(OETAG_MKTGINFO, v); }
    OEBankTransactionList* GetTransactionList() const {
        return static_cast<OEBankTransactionList*>(GetChildObj(OETAG_BANKTRANLIST));
    }
    unsigned short SetTransactionList(OEBankTransactionList* l) { return SetChildObj(OETAG_BANKTRANLIST, l); }
    OELedgerBalance* GetLedgerBalance() const {
        return static_cast<OELedgerBalance*>(GetChildObj(OETAG_LEDGERBAL));
    }
    unsigned short SetLedgerBalance(OELedgerBalance* b) { return SetChildObj(OETAG_LEDGERBAL, b); }
    OEAvailableBalance* GetAvailableBalance() const {
        return static_cast<OEAvailableBalance*>(GetChildObj(OETAG_AVAILBAL));
    }
    unsigned short SetAvailableBalance(OEAvailableBalance* b) { return SetChildObj(OETAG_AVAILBAL, b); }

    OEString3 m_curDef;
    OEOwnedChild m_account, m_tranList, m_ledgerBal, m_availBal;
    OEString360 m_mktgInfo;
};

// Typed access to the FROM account of a statement or statement-end aggregate: OEBankAccount for
// BANKACCTFROM, OECCAccount for CCACCTFROM.
template <class Base, class Account, OETagID Tag> class OEAccountFromOf : public Base {
public:
    explicit OEAccountFromOf(unsigned short version = 0) : Base(version) {}
    Account* GetAccountFrom() const { return static_cast<Account*>(this->GetChildObj(Tag)); }
    unsigned short SetAccountFrom(Account* account) { return this->SetChildObj(Tag, account); }
};

// STMTRS.
class OE_API OEBankStatementRs
    : public OEAccountFromOf<OEGenericStatementRs, OEBankAccount, OETAG_BANKACCTFROM> {
public:
    explicit OEBankStatementRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

// CCSTMTRS: the same with CCACCTFROM.
class OE_API OECCStatementRs : public OEAccountFromOf<OEGenericStatementRs, OECCAccount, OETAG_CCACCTFROM> {
public:
    explicit OECCStatementRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

// The base of the statement requests: one account and at most one INCTRAN.
class OE_API OEGenericStatementRq : public OETransBase {
public:
    explicit OEGenericStatementRq(unsigned short version = 0) : OETransBase(version) {}
    OEIncTransaction* GetIncTransaction() const {
        return static_cast<OEIncTransaction*>(GetChildObj(OETAG_INCTRAN));
    }
    unsigned short SetIncTransaction(OEIncTransaction* inc) { return SetChildObj(OETAG_INCTRAN, inc); }
    // A repeated account or INCTRAN logs OEPW_EXTRAAGG and replaces the old object; the new one
    // comes from the factory with version 0 (the factory's own).
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;

    OEOwnedChild m_account, m_incTran;
};

// STMTRQ.
class OE_API OEBankStatementRq
    : public OEAccountFromOf<OEGenericStatementRq, OEBankAccount, OETAG_BANKACCTFROM> {
public:
    explicit OEBankStatementRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

// CCSTMTRQ.
class OE_API OECCStatementRq : public OEAccountFromOf<OEGenericStatementRq, OECCAccount, OETAG_CCACCTFROM> {
public:
    explicit OECCStatementRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

#endif
