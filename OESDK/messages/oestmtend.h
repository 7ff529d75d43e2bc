// Statement closing information: CLOSING and CCCLOSING, the requests STMTENDRQ / CCSTMTENDRQ and
// the responses STMTENDRS / CCSTMTENDRS that carry a list of closings for one account.
#ifndef OESDK_MESSAGES_OESTMTEND_H
#define OESDK_MESSAGES_OESTMTEND_H
#include "messages/oebank.h"

// What CLOSING and CCCLOSING have in common: the statement's identifier, its dates, the opening
// and closing balances, the posting period, marketing text and the currency.
class OE_API OEClosingBase : public OEAggregate {
public:
    explicit OEClosingBase(unsigned short version = 0) : OEAggregate(version) {}
    OE_TEXT_ACCESSORS(FITId, OETAG_FITID);
    OE_DATE_ACCESSORS(DateOpen, OETAG_DTOPEN);
    OE_DATE_ACCESSORS(DateClose, OETAG_DTCLOSE);
    OE_DATE_ACCESSORS(DateNext, OETAG_DTNEXT);
    OE_AMOUNT_ACCESSORS(BalanceOpen, OETAG_BALOPEN);
    OE_AMOUNT_ACCESSORS(BalanceClose, OETAG_BALCLOSE);
    OE_DATE_ACCESSORS(DatePostStart, OETAG_DTPOSTSTART);
    OE_DATE_ACCESSORS(DatePostEnd, OETAG_DTPOSTEND);
    OE_TEXT_ACCESSORS(MktgInfo, OETAG_MKTGINFO);
    // CURRENCY and ORIGCURRENCY share one member; the object's own tag says which it is.
    OEDataObj* GetCurrency() const { return m_currency.get(); }
    unsigned short SetCurrency(OEDataObj* currency);

    OEString255 m_fitId;
    OEDateTime m_dtOpen, m_dtClose, m_dtNext, m_dtPostStart, m_dtPostEnd;
    OEPrecisionInteger m_balOpen, m_balClose;
    OEString360 m_mktgInfo;
    OEOwnedChild m_currency;
};

// CLOSING: one closing of a bank statement.
class OE_API OEClosing : public OEClosingBase {
public:
    explicit OEClosing(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_AMOUNT_ACCESSORS(BalanceMin, OETAG_BALMIN);
    OE_AMOUNT_TEXT_ACCESSORS(DepositsAndCredits, OETAG_DEPANDCREDIT);
    OE_AMOUNT_TEXT_ACCESSORS(ChecksAndDebits, OETAG_CHKANDDEB);
    OE_AMOUNT_TEXT_ACCESSORS(TotalFees, OETAG_TOTALFEES);
    OE_AMOUNT_TEXT_ACCESSORS(TotalInterest, OETAG_TOTALINT);

    OEPrecisionInteger m_balMin, m_depAndCredit, m_chkAndDeb, m_totalFees, m_totalInt;
};

// CCCLOSING: one closing of a credit card statement.
class OE_API OECCClosing : public OEClosingBase {
public:
    explicit OECCClosing(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_DATE_ACCESSORS(DatePaymentDue, OETAG_DTPMTDUE);
    OE_AMOUNT_TEXT_ACCESSORS(MinPaymentDue, OETAG_MINPMTDUE);
    OE_AMOUNT_TEXT_ACCESSORS(FinanceCharge, OETAG_FINCHG);
    OE_AMOUNT_TEXT_ACCESSORS(PaymentsAndCredits, OETAG_PAYANDCREDIT);
    OE_AMOUNT_TEXT_ACCESSORS(PurchasesAndAdvances, OETAG_PURANDADV);
    OE_AMOUNT_TEXT_ACCESSORS(DebitAdjustments, OETAG_DEBADJ);
    OE_AMOUNT_TEXT_ACCESSORS(CreditLimit, OETAG_CREDITLIMIT);

    OEDateTime m_dtPmtDue;
    OEPrecisionInteger m_minPmtDue, m_finChg, m_payAndCredit, m_purAndAdv, m_debAdj, m_creditLimit;
};

// The statement-end requests: the account and an optional date range. They share the account
// handling of the statement requests (a repeated account logs OEPW_EXTRAAGG and replaces the old
// one); they hold no INCTRAN.
class OE_API OEStatementEndRqBase : public OEDateRangeOf<OEGenericStatementRq> {
public:
    explicit OEStatementEndRqBase(unsigned short version = 0) : OEDateRangeOf(version) {}
};

// STMTENDRQ.
OE_AGGREGATE_CLASS(OEStatementEndRq,
                   OEAccountFromOf<OEStatementEndRqBase, OEBankAccount, OETAG_BANKACCTFROM>);

// CCSTMTENDRQ.
OE_AGGREGATE_CLASS(OECCStatementEndRq, OEAccountFromOf<OEStatementEndRqBase, OECCAccount, OETAG_CCACCTFROM>);

// The statement-end responses: CURDEF, the account and the closings in order.
class OE_API OEStatementEndRsBase : public OETransBase {
public:
    explicit OEStatementEndRsBase(unsigned short version = 0) : OETransBase(version), m_closings(1, 12) {}
    OE_TEXT_ACCESSORS(CurDef, OETAG_CURDEF);
    unsigned short GetNumClosing() const { return m_closings.Entries(); }
    void DeleteAllClosing();

    OEString3 m_curDef;
    OEOwnedChild m_account;
    OEDataObjList m_closings;
};

// STMTENDRS.
class OE_API OEStatementEndRs
    : public OEAccountFromOf<OEStatementEndRsBase, OEBankAccount, OETAG_BANKACCTFROM> {
public:
    explicit OEStatementEndRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ITEMS(Closing, OEClosing, OETAG_CLOSING, m_closings); // the count: GetNumClosing of the base
};

// CCSTMTENDRS.
class OE_API OECCStatementEndRs
    : public OEAccountFromOf<OEStatementEndRsBase, OECCAccount, OETAG_CCACCTFROM> {
public:
    explicit OECCStatementEndRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ITEMS(Closing, OECCClosing, OETAG_CCCLOSING, m_closings); // the count: GetNumClosing of the base
};

#endif
