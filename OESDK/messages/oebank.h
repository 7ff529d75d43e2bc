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
    OE_NUMBER_ACCESSORS(TxType, unsigned short, OETAG_TRNTYPE);
    const char* GetTxTypeText() const;
    OE_DATE_ACCESSORS(DateTimePosted, OETAG_DTPOSTED);
    OE_DATE_ACCESSORS(DateTimeUser, OETAG_DTUSER);
    OE_DATE_ACCESSORS(DateTimeAvailable, OETAG_DTAVAIL);
    OE_AMOUNT_ACCESSORS(TxAmount, OETAG_TRNAMT);
    OE_TEXT_ACCESSORS(FITId, OETAG_FITID);
    OE_TEXT_ACCESSORS(CorrectedFITId, OETAG_CORRECTFITID);
    OE_NUMBER_ACCESSORS(CorrectAction, unsigned short, OETAG_CORRECTACTION);
    OE_TEXT_ACCESSORS(ServerTxId, OETAG_SRVRTID);
    OE_TEXT_ACCESSORS(ServerTxId2, OETAG_SRVRTID2);
    OE_TEXT_ACCESSORS(CheckNum, OETAG_CHECKNUM);
    OE_TEXT_ACCESSORS(ReferenceNum, OETAG_REFNUM);
    OE_TEXT_ACCESSORS(SIC, OETAG_SIC);
    OE_TEXT_ACCESSORS(PayeeId, OETAG_PAYEEID);
    OE_TEXT_ACCESSORS(PayeeId2, OETAG_PAYEEID2);
    OE_TEXT_ACCESSORS(Name, OETAG_NAME);
    OE_TEXT_ACCESSORS(Memo, OETAG_MEMO);
    OE_TEXT_ACCESSORS(Memo2, OETAG_MEMO2);
    // PAYEE and PAYEE2 share one member, as BANKACCTTO and CCACCTTO do, and CURRENCY and
    // ORIGCURRENCY.
    OEPayee* GetPayee() const { return static_cast<OEPayee*>(m_payee.get()); }
    OE_SET_CHILD(Payee, OEPayee, OETAG_PAYEE);
    OE_SET_CHILD(Payee2, OEPayee2, OETAG_PAYEE2);
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
    OE_DATE_ACCESSORS(DateStart, OETAG_DTSTART);
    OE_DATE_ACCESSORS(DateEnd, OETAG_DTEND);

    OEDateTime m_dtStart, m_dtEnd;
};

// BANKTRANLIST: DTSTART, DTEND and the transactions in order.
class OE_API OEBankTransactionList : public OEDateRangeOf<OEAggregate> {
public:
    explicit OEBankTransactionList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ACCESSORS(StatementTx, OEBankStatementTx, OETAG_STMTTRN, m_tx);
    // Replaces the entry at index (index equal to the count appends); the old one is deleted.
    unsigned short SetStatementTx(unsigned short index, OEBankStatementTx* tx);
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
    OE_NUMBER_ACCESSORS(Include, unsigned short, OETAG_INCLUDE);

    unsigned short m_include = 0;
};

// The base of the statement responses: everything but the account, which each names itself.
class OE_API OEGenericStatementRs : public OETransBase {
public:
    explicit OEGenericStatementRs(unsigned short version = 0) : OETransBase(version) {}
    OE_TEXT_ACCESSORS(CurDef, OETAG_CURDEF);
    OE_TEXT_ACCESSORS(MktgInfo, OETAG_MKTGINFO);
    OE_CHILD_ACCESSORS(TransactionList, OEBankTransactionList, OETAG_BANKTRANLIST);
    OE_CHILD_ACCESSORS(LedgerBalance, OELedgerBalance, OETAG_LEDGERBAL);
    OE_CHILD_ACCESSORS(AvailableBalance, OEAvailableBalance, OETAG_AVAILBAL);

    OEString3 m_curDef;
    OEOwnedChild m_account, m_tranList, m_ledgerBal, m_availBal;
    OEString360 m_mktgInfo;
};

// Typed access to the FROM account of a statement or statement-end aggregate: OEBankAccount for
// BANKACCTFROM, OECCAccount for CCACCTFROM.
template <class Base, class Account, OETagID Tag> class OEAccountFromOf : public Base {
public:
    explicit OEAccountFromOf(unsigned short version = 0) : Base(version) {}
    OE_CHILD_ACCESSORS(AccountFrom, Account, Tag);
};

// STMTRS.
OE_AGGREGATE_CLASS(OEBankStatementRs,
                   OEAccountFromOf<OEGenericStatementRs, OEBankAccount, OETAG_BANKACCTFROM>);

// CCSTMTRS: the same with CCACCTFROM.
OE_AGGREGATE_CLASS(OECCStatementRs, OEAccountFromOf<OEGenericStatementRs, OECCAccount, OETAG_CCACCTFROM>);

// The base of the statement requests: one account and at most one INCTRAN.
class OE_API OEGenericStatementRq : public OETransBase {
public:
    explicit OEGenericStatementRq(unsigned short version = 0) : OETransBase(version) {}
    OE_CHILD_ACCESSORS(IncTransaction, OEIncTransaction, OETAG_INCTRAN);
    // A repeated account or INCTRAN logs OEPW_EXTRAAGG and replaces the old object; the new one
    // comes from the factory with version 0 (the factory's own).
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;

    OEOwnedChild m_account, m_incTran;
};

// STMTRQ.
OE_AGGREGATE_CLASS(OEBankStatementRq,
                   OEAccountFromOf<OEGenericStatementRq, OEBankAccount, OETAG_BANKACCTFROM>);

// CCSTMTRQ.
OE_AGGREGATE_CLASS(OECCStatementRq, OEAccountFromOf<OEGenericStatementRq, OECCAccount, OETAG_CCACCTFROM>);

#endif
