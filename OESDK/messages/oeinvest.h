// The investment statement: the request INVSTMTRQ (with INCPOS), the response INVSTMTRS with its
// account INVACCTFROM, the transaction list INVTRANLIST and its twenty-one kinds of transaction,
// the balances INVBAL / BALLIST, and the position list INVPOSLIST with its five kinds of position.
//
// Enumerated elements answer their value as the enumeration of foundation/oeenums.h; an absent
// element answers 0, so test presence with ValidateTag(tag) where 0 is a meaningful value.
#ifndef OESDK_MESSAGES_OEINVEST_H
#define OESDK_MESSAGES_OEINVEST_H
#include "foundation/oeenums.h"
#include "messages/oeaccount.h"
#include "messages/oebank.h"
#include "messages/oeopenorder.h"
#include "messages/oeseclist.h"

// INVACCTFROM: BROKERID and ACCTID, both required.
class OE_API OEInvAcctFrom : public OEAggregate {
public:
    explicit OEInvAcctFrom(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEString* GetBrokerId() const { return GetText(OETAG_BROKERID); }
    unsigned short SetBrokerId(const OEString& v) { return SetFromText(OETAG_BROKERID, v); }
    const OEString* GetAcctId() const { return GetText(OETAG_ACCTID); }
    unsigned short SetAcctId(const OEString& v) { return SetFromText(OETAG_ACCTID, v); }

    OEBoundedString<22> m_brokerId, m_acctId;
};

// INCPOS: DTASOF and INCLUDE (required).
class OE_API OEIncPos : public OEAggregate {
public:
    explicit OEIncPos(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEDateTime* GetDateAsOf() const { return GetDateTime(OETAG_DTASOF); }
    unsigned short SetDateAsOf(const OEString& v) { return SetFromText(OETAG_DTASOF, v); }
    unsigned short SetDateAsOf(const OEDateTime& v) { return SetDateTime(OETAG_DTASOF, v); }
    unsigned short GetInclude() const { return static_cast<unsigned short>(GetNumber(OETAG_INCLUDE)); }
    unsigned short SetInclude(unsigned short v) { return SetNumber(OETAG_INCLUDE, v); }

    OEDateTime m_dtAsOf;
    unsigned short m_include = 0;
};

// INVSTMTRQ: the account and what to include (INCTRAN, INCOO, INCPOS, INCBAL).
class OE_API OEInvStmtRq : public OEAccountFromOf<OETransBase, OEInvAcctFrom, OETAG_INVACCTFROM> {
public:
    explicit OEInvStmtRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEIncTransaction* GetIncTransaction() const {
        return static_cast<OEIncTransaction*>(GetChildObj(OETAG_INCTRAN));
    }
    unsigned short SetIncTransaction(OEIncTransaction* inc) { return SetChildObj(OETAG_INCTRAN, inc); }
    OEIncPos* GetIncPos() const { return static_cast<OEIncPos*>(GetChildObj(OETAG_INCPOS)); }
    unsigned short SetIncPos(OEIncPos* inc) { return SetChildObj(OETAG_INCPOS, inc); }
    // The Y/N marks by tag: INCOO, INCBAL (0 for any other tag).
    unsigned short GetIncludeFlag(OETagID tag) const { return static_cast<unsigned short>(GetNumber(tag)); }
    unsigned short SetIncludeFlag(OETagID tag, unsigned short v);

    OEOwnedChild m_account, m_incTran, m_incPos;
    unsigned short m_incOO = 0, m_incBal = 0;
};

// INVTRAN: what every investment transaction starts with. SRVRTID and MEMO belong to version 1,
// SRVRTID2 and MEMO2 to the others.
class OE_API OEInvTran : public OEAggregate {
public:
    explicit OEInvTran(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEString* GetFITId() const { return GetText(OETAG_FITID); }
    unsigned short SetFITId(const OEString& v) { return SetFromText(OETAG_FITID, v); }
    const OEString* GetServerTxId() const { return GetText(OETAG_SRVRTID); }
    unsigned short SetServerTxId(const OEString& v) { return SetFromText(OETAG_SRVRTID, v); }
    const OEString* GetServerTxId2() const { return GetText(OETAG_SRVRTID2); }
    unsigned short SetServerTxId2(const OEString& v) { return SetFromText(OETAG_SRVRTID2, v); }
    const OEDateTime* GetDateTrade() const { return GetDateTime(OETAG_DTTRADE); }
    unsigned short SetDateTrade(const OEString& v) { return SetFromText(OETAG_DTTRADE, v); }
    unsigned short SetDateTrade(const OEDateTime& v) { return SetDateTime(OETAG_DTTRADE, v); }
    const OEDateTime* GetDateSettle() const { return GetDateTime(OETAG_DTSETTLE); }
    unsigned short SetDateSettle(const OEString& v) { return SetFromText(OETAG_DTSETTLE, v); }
    unsigned short SetDateSettle(const OEDateTime& v) { return SetDateTime(OETAG_DTSETTLE, v); }
    const OEString* GetReversalFITId() const { return GetText(OETAG_REVERSALFITID); }
    unsigned short SetReversalFITId(const OEString& v) { return SetFromText(OETAG_REVERSALFITID, v); }
    const OEString* GetMemo() const { return GetText(OETAG_MEMO); }
    unsigned short SetMemo(const OEString& v) { return SetFromText(OETAG_MEMO, v); }
    const OEString* GetMemo2() const { return GetText(OETAG_MEMO2); }
    unsigned short SetMemo2(const OEString& v) { return SetFromText(OETAG_MEMO2, v); }

    OEString255 m_fitId, m_reversalFitId, m_memo;
    OEBoundedString<10> m_srvrTid;
    OEBoundedString<36> m_srvrTid2;
    OEDateTime m_dtTrade, m_dtSettle;
    OEBoundedString<390> m_memo2;
};

// The elements that many investment transactions share (INVBUY, INVSELL, INCOME, REINVEST and the
// others). A kind without one of them refuses to set it (0) and answers 0 or null. CURRENCY and
// ORIGCURRENCY share one member.
class OE_API OEInvestmentTx : public OEAggregate {
public:
    explicit OEInvestmentTx(unsigned short version = 0) : OEAggregate(version) {}
    OEInvTran* GetInvTran() const { return static_cast<OEInvTran*>(GetChildObj(OETAG_INVTRAN)); }
    unsigned short SetInvTran(OEInvTran* t) { return SetChildObj(OETAG_INVTRAN, t); }
    OESecID* GetSecID() const { return static_cast<OESecID*>(GetChildObj(OETAG_SECID)); }
    unsigned short SetSecID(OESecID* id) { return SetChildObj(OETAG_SECID, id); }
    // Any amount element by tag (UNITS, UNITPRICE, TOTAL, COMMISSION, FEES, GAIN, ...).
    const OEPrecisionInteger* GetAmountOf(OETagID tag) const { return GetAmount(tag); }
    unsigned short SetAmountOf(OETagID tag, const OEPrecisionInteger& v) { return SetAmount(tag, v); }
    const OEPrecisionInteger* GetUnits() const { return GetAmount(OETAG_UNITS); }
    const OEPrecisionInteger* GetUnitPrice() const { return GetAmount(OETAG_UNITPRICE); }
    const OEPrecisionInteger* GetTotal() const { return GetAmount(OETAG_TOTAL); }
    // Any element by tag from its text (enumerations by keyword, Y/N marks, amounts, dates).
    unsigned short SetElement(OETagID tag, const OEString& v) { return SetFromText(tag, v); }
    OESubAcct GetSubAcctSec() const { return static_cast<OESubAcct>(GetNumber(OETAG_SUBACCTSEC)); }
    OESubAcct GetSubAcctFund() const { return static_cast<OESubAcct>(GetNumber(OETAG_SUBACCTFUND)); }
    unsigned short SetSubAcctSec(OESubAcct v) {
        return SetNumber(OETAG_SUBACCTSEC, static_cast<unsigned long>(v));
    }
    unsigned short SetSubAcctFund(OESubAcct v) {
        return SetNumber(OETAG_SUBACCTFUND, static_cast<unsigned long>(v));
    }
    OEIncomeType GetIncomeType() const { return static_cast<OEIncomeType>(GetNumber(OETAG_INCOMETYPE)); }
    unsigned short GetTaxExempt() const { return static_cast<unsigned short>(GetNumber(OETAG_TAXEXEMPT)); }
    OEDataObj* GetCurrency() const { return m_currency.get(); }
    // A CURRENCY or an ORIGCURRENCY (the object's own tag says which); null clears.
    unsigned short SetCurrency(OECurrency* currency);

    OEOwnedChild m_invTran, m_secId, m_currency;
    OEPrecisionInteger m_units, m_unitPrice, m_commission, m_taxes, m_fees, m_load, m_total, m_withholding;
    unsigned short m_subAcctSec = 0, m_subAcctFund = 0, m_incomeType = 0, m_taxExempt = 0;
};

// INVBANKTRAN: a bank transaction (STMTTRN) inside an investment account, and its SUBACCTFUND.
class OE_API OEInvBankTran : public OEInvestmentTx {
public:
    explicit OEInvBankTran(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEBankStatementTx* GetStatementTx() const {
        return static_cast<OEBankStatementTx*>(GetChildObj(OETAG_STMTTRN));
    }
    unsigned short SetStatementTx(OEBankStatementTx* tx) { return SetChildObj(OETAG_STMTTRN, tx); }

    OEOwnedChild m_stmtTrn;
};

// INVBUY and INVSELL: the trade common to the five buy kinds and to the five sell kinds.
// REVERSALFEES and REVERSALFITID belong to the versions after 1.
class OE_API OEInvBuy : public OEInvestmentTx {
public:
    explicit OEInvBuy(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;

    OEPrecisionInteger m_markup, m_reversalFees;
    OEString255 m_reversalFitId;
};

class OE_API OEInvSell : public OEInvestmentTx {
public:
    explicit OEInvSell(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;

    OEPrecisionInteger m_markdown, m_reversalFees, m_gain;
    OEString255 m_reversalFitId;
};

// The elements of the buy and sell kinds around their INVBUY / INVSELL (Trade), which each kind
// holds as a child aggregate. A kind without an element refuses to set it (0) and answers 0 or null.
template <class Trade, OETagID TradeTag> class OETradeOf : public OEAggregate {
public:
    explicit OETradeOf(unsigned short version = 0) : OEAggregate(version) {}
    Trade* GetTrade() const { return static_cast<Trade*>(GetChildObj(TradeTag)); }
    unsigned short SetTrade(Trade* t) { return SetChildObj(TradeTag, t); }
    // Any element by tag from its text (BUYTYPE, SELLTYPE, ACCRDINT, RELFITID, SHPERCTRCT, ...).
    unsigned short SetElement(OETagID tag, const OEString& v) { return SetFromText(tag, v); }
    // The value of an enumerated, Y/N or count element by tag (0 when absent).
    unsigned long GetNumberOf(OETagID tag) const { return GetNumber(tag); }
    const OEPrecisionInteger* GetAccruedInterest() const { return GetAmount(OETAG_ACCRDINT); }
    const OEPrecisionInteger* GetAvgCostBasis() const { return GetAmount(OETAG_AVGCOSTBASIS); }
    const OEString* GetRelFITId() const { return GetText(OETAG_RELFITID); }
    OEBuyType GetBuyType() const { return static_cast<OEBuyType>(GetNumber(OETAG_BUYTYPE)); }
    OESellType GetSellType() const { return static_cast<OESellType>(GetNumber(OETAG_SELLTYPE)); }
    OEOptBuyType GetOptBuyType() const { return static_cast<OEOptBuyType>(GetNumber(OETAG_OPTBUYTYPE)); }
    OEOptSellType GetOptSellType() const { return static_cast<OEOptSellType>(GetNumber(OETAG_OPTSELLTYPE)); }
    OESellReason GetSellReason() const { return static_cast<OESellReason>(GetNumber(OETAG_SELLREASON)); }

    OEOwnedChild m_trade;
    unsigned short m_type = 0, m_relType = 0, m_secured = 0; // BUYTYPE / SELLTYPE / OPT... / SELLREASON
    unsigned long m_shPerCtrct = 0;
    OEPrecisionInteger m_accrdInt, m_avgCostBasis;
    OEString255 m_relFitId;
};
typedef OETradeOf<OEInvBuy, OETAG_INVBUY> OEBuyTrade;
typedef OETradeOf<OEInvSell, OETAG_INVSELL> OESellTrade;

#define OE_INVEST_CLASS(C, Base)                                                                             \
    class OE_API C : public Base {                                                                           \
    public:                                                                                                  \
        explicit C(unsigned short version = 0);                                                              \
        const OEAggregateDesc& Describe() const override;                                                    \
    };
// BUYSTOCK (BUYTYPE), BUYMF (BUYTYPE, RELFITID), BUYDEBT (ACCRDINT), BUYOPT (OPTBUYTYPE,
// SHPERCTRCT), BUYOTHER (BUYTYPE after version 1).
OE_INVEST_CLASS(OEBuyStock, OEBuyTrade)
OE_INVEST_CLASS(OEBuyMF, OEBuyTrade)
OE_INVEST_CLASS(OEBuyDebt, OEBuyTrade)
OE_INVEST_CLASS(OEBuyOpt, OEBuyTrade)
OE_INVEST_CLASS(OEBuyOther, OEBuyTrade)
// SELLSTOCK (SELLTYPE), SELLMF (SELLTYPE, AVGCOSTBASIS, RELFITID), SELLDEBT (SELLREASON, ACCRDINT),
// SELLOPT (OPTSELLTYPE, SHPERCTRCT, RELFITID, RELTYPE, SECURED), SELLOTHER (SELLTYPE after version 1).
OE_INVEST_CLASS(OESellStock, OESellTrade)
OE_INVEST_CLASS(OESellMF, OESellTrade)
OE_INVEST_CLASS(OESellDebt, OESellTrade)
OE_INVEST_CLASS(OESellOpt, OESellTrade)
OE_INVEST_CLASS(OESellOther, OESellTrade)

// The other transactions: their own elements beyond OEInvestmentTx are reached by tag.
class OE_API OEOtherInvestmentTx : public OEInvestmentTx {
public:
    explicit OEOtherInvestmentTx(unsigned short version = 0) : OEInvestmentTx(version) {}
    const OEPrecisionInteger* GetAmountOfTag(OETagID tag) const { return GetAmount(tag); }
    unsigned long GetNumberOf(OETagID tag) const { return GetNumber(tag); }
    const OEDateTime* GetDateOf(OETagID tag) const { return GetDateTime(tag); }
    const OEString* GetTextOf(OETagID tag) const { return GetText(tag); }
    // SPLIT
    const OEPrecisionInteger* GetOldUnits() const { return GetAmount(OETAG_OLDUNITS); }
    const OEPrecisionInteger* GetNewUnits() const { return GetAmount(OETAG_NEWUNITS); }
    const OEPrecisionInteger* GetNumerator() const { return GetAmount(OETAG_NUMERATOR); }
    const OEPrecisionInteger* GetDenominator() const { return GetAmount(OETAG_DENOMINATOR); }
    // JRNLFUND, JRNLSEC
    OESubAcct GetSubAcctTo() const { return static_cast<OESubAcct>(GetNumber(OETAG_SUBACCTTO)); }
    OESubAcct GetSubAcctFrom() const { return static_cast<OESubAcct>(GetNumber(OETAG_SUBACCTFROM)); }
    // TRANSFER, CLOSUREOPT
    OETferAction GetTferAction() const { return static_cast<OETferAction>(GetNumber(OETAG_TFERACTION)); }
    OEPosType GetPosType() const { return static_cast<OEPosType>(GetNumber(OETAG_POSTYPE)); }
    OEOptAction GetOptAction() const { return static_cast<OEOptAction>(GetNumber(OETAG_OPTACTION)); }
    // TRANSFER's INVACCTFROM.
    OEInvAcctFrom* GetInvAcctFrom() const {
        return static_cast<OEInvAcctFrom*>(GetChildObj(OETAG_INVACCTFROM));
    }
    unsigned short SetInvAcctFrom(OEInvAcctFrom* a) { return SetChildObj(OETAG_INVACCTFROM, a); }

    OEPrecisionInteger m_oldUnits, m_newUnits, m_numerator, m_denominator, m_fracCash, m_avgCostBasis, m_gain;
    unsigned short m_subAcctTo = 0, m_subAcctFrom = 0, m_action = 0, m_posType = 0;
    unsigned long m_shPerCtrct = 0;
    OEDateTime m_dtPurchase;
    OEString255 m_relFitId;
    OEOwnedChild m_invAcctFrom;
};
OE_INVEST_CLASS(OEIncome, OEOtherInvestmentTx)
OE_INVEST_CLASS(OEReinvest, OEOtherInvestmentTx)
OE_INVEST_CLASS(OERetOfCap, OEOtherInvestmentTx)
OE_INVEST_CLASS(OESplit, OEOtherInvestmentTx)
OE_INVEST_CLASS(OETransfer, OEOtherInvestmentTx)
OE_INVEST_CLASS(OEJrnlFund, OEOtherInvestmentTx)
OE_INVEST_CLASS(OEJrnlSec, OEOtherInvestmentTx)
OE_INVEST_CLASS(OEMarginInterest, OEOtherInvestmentTx)
OE_INVEST_CLASS(OEClosureOpt, OEOtherInvestmentTx)
OE_INVEST_CLASS(OEInvExpense, OEOtherInvestmentTx)

// INVTRANLIST: DTSTART, DTEND and the transactions of every kind, in the order read or appended.
class OE_API OEInvTranList : public OEDateRangeOf<OEMixedList> {
public:
    explicit OEInvTranList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // Appends a transaction of any of the twenty-one kinds (its own tag says which); the list
    // owns it. 0 for null or another kind (the caller keeps it).
    unsigned short AppendTransaction(OEAggregate* tx) { return AppendEntry(tx); }
    OEAggregate* GetTransaction(unsigned short index) const {
        return static_cast<OEAggregate*>(m_entries.Get(index));
    }
    unsigned short GetNumTransaction() const { return m_entries.Entries(); }
    void DeleteAllTransaction() { DeleteAllEntries(); }
};

// BALLIST: BAL entries in order.
class OE_API OEBalList : public OEAggregate {
public:
    explicit OEBalList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AppendBalance(OEBalance* bal) { return AppendToList(OETAG_BAL, bal); }
    OEBalance* GetBalance(unsigned short index) const { return static_cast<OEBalance*>(m_bal.Get(index)); }
    unsigned short GetNumBalance() const { return m_bal.Entries(); }

    OEDataObjList m_bal;
};

// INVBAL: AVAILCASH, MARGINBALANCE, SHORTBALANCE (required), BUYPOWER and BALLIST.
class OE_API OEInvBal : public OEAggregate {
public:
    explicit OEInvBal(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEPrecisionInteger* GetAvailCash() const { return GetAmount(OETAG_AVAILCASH); }
    unsigned short SetAvailCash(const OEPrecisionInteger& v) { return SetAmount(OETAG_AVAILCASH, v); }
    const OEPrecisionInteger* GetMarginBalance() const { return GetAmount(OETAG_MARGINBALANCE); }
    unsigned short SetMarginBalance(const OEPrecisionInteger& v) { return SetAmount(OETAG_MARGINBALANCE, v); }
    const OEPrecisionInteger* GetShortBalance() const { return GetAmount(OETAG_SHORTBALANCE); }
    unsigned short SetShortBalance(const OEPrecisionInteger& v) { return SetAmount(OETAG_SHORTBALANCE, v); }
    const OEPrecisionInteger* GetBuyPower() const { return GetAmount(OETAG_BUYPOWER); }
    unsigned short SetBuyPower(const OEPrecisionInteger& v) { return SetAmount(OETAG_BUYPOWER, v); }
    OEBalList* GetBalList() const { return static_cast<OEBalList*>(GetChildObj(OETAG_BALLIST)); }
    unsigned short SetBalList(OEBalList* l) { return SetChildObj(OETAG_BALLIST, l); }

    OEPrecisionInteger m_availCash, m_marginBalance, m_shortBalance, m_buyPower;
    OEOwnedChild m_balList;
};

// INVPOS: the position common to the five kinds. AVGCOSTBASIS and MEMO2 belong to the versions
// after 1, MEMO to version 1.
class OE_API OEInvPos : public OEAggregate {
public:
    explicit OEInvPos(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OESecID* GetSecID() const { return static_cast<OESecID*>(GetChildObj(OETAG_SECID)); }
    unsigned short SetSecID(OESecID* id) { return SetChildObj(OETAG_SECID, id); }
    OESubAcct GetHeldInAcct() const { return static_cast<OESubAcct>(GetNumber(OETAG_HELDINACCT)); }
    OEPosType GetPosType() const { return static_cast<OEPosType>(GetNumber(OETAG_POSTYPE)); }
    const OEPrecisionInteger* GetUnits() const { return GetAmount(OETAG_UNITS); }
    const OEPrecisionInteger* GetUnitPrice() const { return GetAmount(OETAG_UNITPRICE); }
    const OEPrecisionInteger* GetMarketValue() const { return GetAmount(OETAG_MKTVAL); }
    const OEPrecisionInteger* GetAvgCostBasis() const { return GetAmount(OETAG_AVGCOSTBASIS); }
    const OEDateTime* GetDatePriceAsOf() const { return GetDateTime(OETAG_DTPRICEASOF); }
    const OEString* GetMemo() const { return GetText(OETAG_MEMO); }
    const OEString* GetMemo2() const { return GetText(OETAG_MEMO2); }
    OECurrency* GetCurrency() const { return static_cast<OECurrency*>(GetChildObj(OETAG_CURRENCY)); }
    unsigned short SetCurrency(OECurrency* c) { return SetChildObj(OETAG_CURRENCY, c); }
    // Any element by tag from its text.
    unsigned short SetElement(OETagID tag, const OEString& v) { return SetFromText(tag, v); }

    OEOwnedChild m_secId, m_currency;
    unsigned short m_heldInAcct = 0, m_posType = 0;
    OEPrecisionInteger m_units, m_unitPrice, m_mktVal, m_avgCostBasis;
    OEDateTime m_dtPriceAsOf;
    OEString255 m_memo;
    OEBoundedString<390> m_memo2;
};

// The five position kinds: INVPOS as a child aggregate, and UNITSSTREET, UNITSUSER, REINVDIV
// (POSSTOCK, POSMF), REINVCG (POSMF), SECURED (POSOPT).
class OE_API OEPosition : public OEAggregate {
public:
    explicit OEPosition(unsigned short version = 0) : OEAggregate(version) {}
    OEInvPos* GetInvPos() const { return static_cast<OEInvPos*>(GetChildObj(OETAG_INVPOS)); }
    unsigned short SetInvPos(OEInvPos* p) { return SetChildObj(OETAG_INVPOS, p); }
    const OEPrecisionInteger* GetUnitsStreet() const { return GetAmount(OETAG_UNITSSTREET); }
    const OEPrecisionInteger* GetUnitsUser() const { return GetAmount(OETAG_UNITSUSER); }
    unsigned short GetReinvDiv() const { return static_cast<unsigned short>(GetNumber(OETAG_REINVDIV)); }
    unsigned short GetReinvCG() const { return static_cast<unsigned short>(GetNumber(OETAG_REINVCG)); }
    OESecured GetSecured() const { return static_cast<OESecured>(GetNumber(OETAG_SECURED)); }
    unsigned short SetElement(OETagID tag, const OEString& v) { return SetFromText(tag, v); }

    OEOwnedChild m_invPos;
    OEPrecisionInteger m_unitsStreet, m_unitsUser;
    unsigned short m_reinvDiv = 0, m_reinvCG = 0, m_secured = 0;
};
OE_INVEST_CLASS(OEPosStock, OEPosition)
OE_INVEST_CLASS(OEPosMF, OEPosition)
OE_INVEST_CLASS(OEPosDebt, OEPosition)
OE_INVEST_CLASS(OEPosOpt, OEPosition)
OE_INVEST_CLASS(OEPosOther, OEPosition)
#undef OE_INVEST_CLASS

// INVPOSLIST: positions of the five kinds, in the order read or appended.
class OE_API OEInvPosList : public OEMixedList {
public:
    explicit OEInvPosList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AppendPosition(OEPosition* pos) { return AppendEntry(pos); }
    OEPosition* GetPosition(unsigned short index) const {
        return static_cast<OEPosition*>(m_entries.Get(index));
    }
    unsigned short GetNumPosition() const { return m_entries.Entries(); }
    void DeleteAllPosition() { DeleteAllEntries(); }
};

// INVSTMTRS: DTASOF, CURDEF, the account, the transaction and position lists, the balances, the
// open orders (INVOOLIST) and MKTGINFO.
class OE_API OEInvStmtRs : public OEAccountFromOf<OETransBase, OEInvAcctFrom, OETAG_INVACCTFROM> {
public:
    explicit OEInvStmtRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEDateTime* GetDateAsOf() const { return GetDateTime(OETAG_DTASOF); }
    unsigned short SetDateAsOf(const OEString& v) { return SetFromText(OETAG_DTASOF, v); }
    unsigned short SetDateAsOf(const OEDateTime& v) { return SetDateTime(OETAG_DTASOF, v); }
    const OEString* GetCurDef() const { return GetText(OETAG_CURDEF); }
    unsigned short SetCurDef(const OEString& v) { return SetFromText(OETAG_CURDEF, v); }
    const OEString* GetMktgInfo() const { return GetText(OETAG_MKTGINFO); }
    unsigned short SetMktgInfo(const OEString& v) { return SetFromText(OETAG_MKTGINFO, v); }
    OEInvTranList* GetTranList() const { return static_cast<OEInvTranList*>(GetChildObj(OETAG_INVTRANLIST)); }
    unsigned short SetTranList(OEInvTranList* l) { return SetChildObj(OETAG_INVTRANLIST, l); }
    OEInvPosList* GetPosList() const { return static_cast<OEInvPosList*>(GetChildObj(OETAG_INVPOSLIST)); }
    unsigned short SetPosList(OEInvPosList* l) { return SetChildObj(OETAG_INVPOSLIST, l); }
    OEInvBal* GetInvBal() const { return static_cast<OEInvBal*>(GetChildObj(OETAG_INVBAL)); }
    unsigned short SetInvBal(OEInvBal* b) { return SetChildObj(OETAG_INVBAL, b); }
    OEInvOOList* GetOOList() const { return static_cast<OEInvOOList*>(GetChildObj(OETAG_INVOOLIST)); }
    unsigned short SetOOList(OEInvOOList* l) { return SetChildObj(OETAG_INVOOLIST, l); }

    OEDateTime m_dtAsOf;
    OEString3 m_curDef;
    OEOwnedChild m_account, m_tranList, m_posList, m_invBal, m_ooList;
    OEString360 m_mktgInfo;
};

#endif
