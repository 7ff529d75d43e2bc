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
    const OEString* GetFITId() const { return GetText(OETAG_FITID); }
    unsigned short SetFITId(const OEString& v) { return SetFromText(OETAG_FITID, v); }
    const OEDateTime* GetDateOpen() const { return GetDateTime(OETAG_DTOPEN); }
    unsigned short SetDateOpen(const OEString& v) { return SetFromText(OETAG_DTOPEN, v); }
    unsigned short SetDateOpen(const OEDateTime& v) { return SetDateTime(OETAG_DTOPEN, v); }
    const OEDateTime* GetDateClose() const { return GetDateTime(OETAG_DTCLOSE); }
    unsigned short SetDateClose(const OEString& v) { return SetFromText(OETAG_DTCLOSE, v); }
    unsigned short SetDateClose(const OEDateTime& v) { return SetDateTime(OETAG_DTCLOSE, v); }
    const OEDateTime* GetDateNext() const { return GetDateTime(OETAG_DTNEXT); }
    unsigned short SetDateNext(const OEString& v) { return SetFromText(OETAG_DTNEXT, v); }
    unsigned short SetDateNext(const OEDateTime& v) { return SetDateTime(OETAG_DTNEXT, v); }
    const OEPrecisionInteger* GetBalanceOpen() const { return GetAmount(OETAG_BALOPEN); }
    unsigned short SetBalanceOpen(const OEString& v) { return SetFromText(OETAG_BALOPEN, v); }
    unsigned short SetBalanceOpen(const OEPrecisionInteger& v) { return SetAmount(OETAG_BALOPEN, v); }
    const OEPrecisionInteger* GetBalanceClose() const { return GetAmount(OETAG_BALCLOSE); }
    unsigned short SetBalanceClose(const OEString& v) { return SetFromText(OETAG_BALCLOSE, v); }
    unsigned short SetBalanceClose(const OEPrecisionInteger& v) { return SetAmount(OETAG_BALCLOSE, v); }
    const OEDateTime* GetDatePostStart() const { return GetDateTime(OETAG_DTPOSTSTART); }
    unsigned short SetDatePostStart(const OEString& v) { return SetFromText(OETAG_DTPOSTSTART, v); }
    unsigned short SetDatePostStart(const OEDateTime& v) { return SetDateTime(OETAG_DTPOSTSTART, v); }
    const OEDateTime* GetDatePostEnd() const { return GetDateTime(OETAG_DTPOSTEND); }
    unsigned short SetDatePostEnd(const OEString& v) { return SetFromText(OETAG_DTPOSTEND, v); }
    unsigned short SetDatePostEnd(const OEDateTime& v) { return SetDateTime(OETAG_DTPOSTEND, v); }
    const OEString* GetMktgInfo() const { return GetText(OETAG_MKTGINFO); }
    unsigned short SetMktgInfo(const OEString& v) { return SetFromText(OETAG_MKTGINFO, v); }
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
    const OEPrecisionInteger* GetBalanceMin() const { return GetAmount(OETAG_BALMIN); }
    unsigned short SetBalanceMin(const OEString& v) { return SetFromText(OETAG_BALMIN, v); }
    unsigned short SetBalanceMin(const OEPrecisionInteger& v) { return SetAmount(OETAG_BALMIN, v); }
    const OEPrecisionInteger* GetDepositsAndCredits() const { return GetAmount(OETAG_DEPANDCREDIT); }
    unsigned short SetDepositsAndCredits(const OEString& v) { return SetFromText(OETAG_DEPANDCREDIT, v); }
    const OEPrecisionInteger* GetChecksAndDebits() const { return GetAmount(OETAG_CHKANDDEB); }
    unsigned short SetChecksAndDebits(const OEString& v) { return SetFromText(OETAG_CHKANDDEB, v); }
    const OEPrecisionInteger* GetTotalFees() const { return GetAmount(OETAG_TOTALFEES); }
    unsigned short SetTotalFees(const OEString& v) { return SetFromText(OETAG_TOTALFEES, v); }
    const OEPrecisionInteger* GetTotalInterest() const { return GetAmount(OETAG_TOTALINT); }
    unsigned short SetTotalInterest(const OEString& v) { return SetFromText(OETAG_TOTALINT, v); }

    OEPrecisionInteger m_balMin, m_depAndCredit, m_chkAndDeb, m_totalFees, m_totalInt;
};

// CCCLOSING: one closing of a credit card statement.
class OE_API OECCClosing : public OEClosingBase {
public:
    explicit OECCClosing(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEDateTime* GetDatePaymentDue() const { return GetDateTime(OETAG_DTPMTDUE); }
    unsigned short SetDatePaymentDue(const OEString& v) { return SetFromText(OETAG_DTPMTDUE, v); }
    unsigned short SetDatePaymentDue(const OEDateTime& v) { return SetDateTime(OETAG_DTPMTDUE, v); }
    const OEPrecisionInteger* GetMinPaymentDue() const { return GetAmount(OETAG_MINPMTDUE); }
    unsigned short SetMinPaymentDue(const OEString& v) { return SetFromText(OETAG_MINPMTDUE, v); }
    const OEPrecisionInteger* GetFinanceCharge() const { return GetAmount(OETAG_FINCHG); }
    unsigned short SetFinanceCharge(const OEString& v) { return SetFromText(OETAG_FINCHG, v); }
    const OEPrecisionInteger* GetPaymentsAndCredits() const { return GetAmount(OETAG_PAYANDCREDIT); }
    unsigned short SetPaymentsAndCredits(const OEString& v) { return SetFromText(OETAG_PAYANDCREDIT, v); }
    const OEPrecisionInteger* GetPurchasesAndAdvances() const { return GetAmount(OETAG_PURANDADV); }
    unsigned short SetPurchasesAndAdvances(const OEString& v) { return SetFromText(OETAG_PURANDADV, v); }
    const OEPrecisionInteger* GetDebitAdjustments() const { return GetAmount(OETAG_DEBADJ); }
    unsigned short SetDebitAdjustments(const OEString& v) { return SetFromText(OETAG_DEBADJ, v); }
    const OEPrecisionInteger* GetCreditLimit() const { return GetAmount(OETAG_CREDITLIMIT); }
    unsigned short SetCreditLimit(const OEString& v) { return SetFromText(OETAG_CREDITLIMIT, v); }

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
class OE_API OEStatementEndRq
    : public OEAccountFromOf<OEStatementEndRqBase, OEBankAccount, OETAG_BANKACCTFROM> {
public:
    explicit OEStatementEndRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

// CCSTMTENDRQ.
class OE_API OECCStatementEndRq
    : public OEAccountFromOf<OEStatementEndRqBase, OECCAccount, OETAG_CCACCTFROM> {
public:
    explicit OECCStatementEndRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

// The statement-end responses: CURDEF, the account and the closings in order.
class OE_API OEStatementEndRsBase : public OETransBase {
public:
    explicit OEStatementEndRsBase(unsigned short version = 0) : OETransBase(version), m_closings(1, 12) {}
    const OEString* GetCurDef() const { return GetText(OETAG_CURDEF); }
    unsigned short SetCurDef(const OEString& v) { return SetFromText(OETAG_CURDEF, v); }
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
    unsigned short AppendClosing(OEClosing* c) { return AppendToList(OETAG_CLOSING, c); }
    OEClosing* GetClosing(unsigned short index) const {
        return static_cast<OEClosing*>(m_closings.Get(index));
    }
};

// CCSTMTENDRS.
class OE_API OECCStatementEndRs
    : public OEAccountFromOf<OEStatementEndRsBase, OECCAccount, OETAG_CCACCTFROM> {
public:
    explicit OECCStatementEndRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AppendClosing(OECCClosing* c) { return AppendToList(OETAG_CCCLOSING, c); }
    OECCClosing* GetClosing(unsigned short index) const {
        return static_cast<OECCClosing*>(m_closings.Get(index));
    }
};

#endif
