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
    OE_TEXT_ACCESSORS(BrokerId, OETAG_BROKERID);
    OE_TEXT_ACCESSORS(AcctId, OETAG_ACCTID);

    OEBoundedString<22> m_brokerId, m_acctId;
};

// INCPOS: DTASOF and INCLUDE (required).
class OE_API OEIncPos : public OEAggregate {
public:
    explicit OEIncPos(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_DATE_ACCESSORS(DateAsOf, OETAG_DTASOF);
    OE_NUMBER_VALUE_ACCESSORS(Include, unsigned short, OETAG_INCLUDE);

    OEDateTime m_dtAsOf;
    unsigned short m_include = 0;
};

// INVSTMTRQ: the account and what to include (INCTRAN, INCOO, INCPOS, INCBAL).
class OE_API OEInvStmtRq : public OEAccountFromOf<OETransBase, OEInvAcctFrom, OETAG_INVACCTFROM> {
public:
    explicit OEInvStmtRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_CHILD_ACCESSORS(IncTransaction, OEIncTransaction, OETAG_INCTRAN);
    OE_CHILD_ACCESSORS(IncPos, OEIncPos, OETAG_INCPOS);
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
    OE_TEXT_ACCESSORS(FITId, OETAG_FITID);
    OE_TEXT_ACCESSORS(ServerTxId, OETAG_SRVRTID);
    OE_TEXT_ACCESSORS(ServerTxId2, OETAG_SRVRTID2);
    OE_DATE_ACCESSORS(DateTrade, OETAG_DTTRADE);
    OE_DATE_ACCESSORS(DateSettle, OETAG_DTSETTLE);
    OE_TEXT_ACCESSORS(ReversalFITId, OETAG_REVERSALFITID);
    OE_TEXT_ACCESSORS(Memo, OETAG_MEMO);
    OE_TEXT_ACCESSORS(Memo2, OETAG_MEMO2);

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
    OE_CHILD_ACCESSORS(InvTran, OEInvTran, OETAG_INVTRAN);
    OE_CHILD_ACCESSORS(SecID, OESecID, OETAG_SECID);
    // Any amount element by tag (UNITS, UNITPRICE, TOTAL, COMMISSION, FEES, GAIN, ...).
    const OEPrecisionInteger* GetAmountOf(OETagID tag) const { return GetAmount(tag); }
    unsigned short SetAmountOf(OETagID tag, const OEPrecisionInteger& v) { return SetAmount(tag, v); }
    OE_GET_AMOUNT(Units, OETAG_UNITS);
    OE_GET_AMOUNT(UnitPrice, OETAG_UNITPRICE);
    OE_GET_AMOUNT(Total, OETAG_TOTAL);
    // Any element by tag from its text (enumerations by keyword, Y/N marks, amounts, dates).
    unsigned short SetElement(OETagID tag, const OEString& v) { return SetFromText(tag, v); }
    OE_NUMBER_VALUE_ACCESSORS(SubAcctSec, OESubAcct, OETAG_SUBACCTSEC);
    OE_NUMBER_VALUE_ACCESSORS(SubAcctFund, OESubAcct, OETAG_SUBACCTFUND);
    OE_GET_NUMBER(IncomeType, OEIncomeType, OETAG_INCOMETYPE);
    OE_GET_NUMBER(TaxExempt, unsigned short, OETAG_TAXEXEMPT);
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
    OE_CHILD_ACCESSORS(StatementTx, OEBankStatementTx, OETAG_STMTTRN);

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
    OE_CHILD_ACCESSORS(Trade, Trade, TradeTag);
    // Any element by tag from its text (BUYTYPE, SELLTYPE, ACCRDINT, RELFITID, SHPERCTRCT, ...).
    unsigned short SetElement(OETagID tag, const OEString& v) { return SetFromText(tag, v); }
    // The value of an enumerated, Y/N or count element by tag (0 when absent).
    unsigned long GetNumberOf(OETagID tag) const { return GetNumber(tag); }
    OE_GET_AMOUNT(AccruedInterest, OETAG_ACCRDINT);
    OE_GET_AMOUNT(AvgCostBasis, OETAG_AVGCOSTBASIS);
    OE_GET_TEXT(RelFITId, OETAG_RELFITID);
    OE_GET_NUMBER(BuyType, OEBuyType, OETAG_BUYTYPE);
    OE_GET_NUMBER(SellType, OESellType, OETAG_SELLTYPE);
    OE_GET_NUMBER(OptBuyType, OEOptBuyType, OETAG_OPTBUYTYPE);
    OE_GET_NUMBER(OptSellType, OEOptSellType, OETAG_OPTSELLTYPE);
    OE_GET_NUMBER(SellReason, OESellReason, OETAG_SELLREASON);

    OEOwnedChild m_trade;
    unsigned short m_type = 0, m_relType = 0, m_secured = 0; // BUYTYPE / SELLTYPE / OPT... / SELLREASON
    unsigned long m_shPerCtrct = 0;
    OEPrecisionInteger m_accrdInt, m_avgCostBasis;
    OEString255 m_relFitId;
};
typedef OETradeOf<OEInvBuy, OETAG_INVBUY> OEBuyTrade;
typedef OETradeOf<OEInvSell, OETAG_INVSELL> OESellTrade;

// BUYSTOCK (BUYTYPE), BUYMF (BUYTYPE, RELFITID), BUYDEBT (ACCRDINT), BUYOPT (OPTBUYTYPE,
// SHPERCTRCT), BUYOTHER (BUYTYPE after version 1).
OE_AGGREGATE_CLASS(OEBuyStock, OEBuyTrade);
OE_AGGREGATE_CLASS(OEBuyMF, OEBuyTrade);
OE_AGGREGATE_CLASS(OEBuyDebt, OEBuyTrade);
OE_AGGREGATE_CLASS(OEBuyOpt, OEBuyTrade);
OE_AGGREGATE_CLASS(OEBuyOther, OEBuyTrade);
// SELLSTOCK (SELLTYPE), SELLMF (SELLTYPE, AVGCOSTBASIS, RELFITID), SELLDEBT (SELLREASON, ACCRDINT),
// SELLOPT (OPTSELLTYPE, SHPERCTRCT, RELFITID, RELTYPE, SECURED), SELLOTHER (SELLTYPE after version 1).
OE_AGGREGATE_CLASS(OESellStock, OESellTrade);
OE_AGGREGATE_CLASS(OESellMF, OESellTrade);
OE_AGGREGATE_CLASS(OESellDebt, OESellTrade);
OE_AGGREGATE_CLASS(OESellOpt, OESellTrade);
OE_AGGREGATE_CLASS(OESellOther, OESellTrade);

// The other transactions: their own elements beyond OEInvestmentTx are reached by tag.
class OE_API OEOtherInvestmentTx : public OEInvestmentTx {
public:
    explicit OEOtherInvestmentTx(unsigned short version = 0) : OEInvestmentTx(version) {}
    const OEPrecisionInteger* GetAmountOfTag(OETagID tag) const { return GetAmount(tag); }
    unsigned long GetNumberOf(OETagID tag) const { return GetNumber(tag); }
    const OEDateTime* GetDateOf(OETagID tag) const { return GetDateTime(tag); }
    const OEString* GetTextOf(OETagID tag) const { return GetText(tag); }
    // SPLIT
    OE_GET_AMOUNT(OldUnits, OETAG_OLDUNITS);
    OE_GET_AMOUNT(NewUnits, OETAG_NEWUNITS);
    OE_GET_AMOUNT(Numerator, OETAG_NUMERATOR);
    OE_GET_AMOUNT(Denominator, OETAG_DENOMINATOR);
    // JRNLFUND, JRNLSEC
    OE_GET_NUMBER(SubAcctTo, OESubAcct, OETAG_SUBACCTTO);
    OE_GET_NUMBER(SubAcctFrom, OESubAcct, OETAG_SUBACCTFROM);
    // TRANSFER, CLOSUREOPT
    OE_GET_NUMBER(TferAction, OETferAction, OETAG_TFERACTION);
    OE_GET_NUMBER(PosType, OEPosType, OETAG_POSTYPE);
    OE_GET_NUMBER(OptAction, OEOptAction, OETAG_OPTACTION);
    // TRANSFER's INVACCTFROM.
    OE_CHILD_ACCESSORS(InvAcctFrom, OEInvAcctFrom, OETAG_INVACCTFROM);

    OEPrecisionInteger m_oldUnits, m_newUnits, m_numerator, m_denominator, m_fracCash, m_avgCostBasis, m_gain;
    unsigned short m_subAcctTo = 0, m_subAcctFrom = 0, m_action = 0, m_posType = 0;
    unsigned long m_shPerCtrct = 0;
    OEDateTime m_dtPurchase;
    OEString255 m_relFitId;
    OEOwnedChild m_invAcctFrom;
};
OE_AGGREGATE_CLASS(OEIncome, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OEReinvest, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OERetOfCap, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OESplit, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OETransfer, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OEJrnlFund, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OEJrnlSec, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OEMarginInterest, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OEClosureOpt, OEOtherInvestmentTx);
OE_AGGREGATE_CLASS(OEInvExpense, OEOtherInvestmentTx);

// INVTRANLIST: DTSTART, DTEND and the transactions of every kind, in the order read or appended.
class OE_API OEInvTranList : public OEDateRangeOf<OEMixedList> {
public:
    explicit OEInvTranList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // AppendTransaction takes a transaction of any of the twenty-one kinds (its own tag says
    // which); the list owns it. 0 for null or another kind (the caller keeps it).
    OE_ENTRY_ACCESSORS(Transaction, OEAggregate);
};

// BALLIST: BAL entries in order.
class OE_API OEBalList : public OEAggregate {
public:
    explicit OEBalList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ACCESSORS(Balance, OEBalance, OETAG_BAL, m_bal);

    OEDataObjList m_bal;
};

// INVBAL: AVAILCASH, MARGINBALANCE, SHORTBALANCE (required), BUYPOWER and BALLIST.
class OE_API OEInvBal : public OEAggregate {
public:
    explicit OEInvBal(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_AMOUNT_VALUE_ACCESSORS(AvailCash, OETAG_AVAILCASH);
    OE_AMOUNT_VALUE_ACCESSORS(MarginBalance, OETAG_MARGINBALANCE);
    OE_AMOUNT_VALUE_ACCESSORS(ShortBalance, OETAG_SHORTBALANCE);
    OE_AMOUNT_VALUE_ACCESSORS(BuyPower, OETAG_BUYPOWER);
    OE_CHILD_ACCESSORS(BalList, OEBalList, OETAG_BALLIST);

    OEPrecisionInteger m_availCash, m_marginBalance, m_shortBalance, m_buyPower;
    OEOwnedChild m_balList;
};

// INVPOS: the position common to the five kinds. AVGCOSTBASIS and MEMO2 belong to the versions
// after 1, MEMO to version 1.
class OE_API OEInvPos : public OEAggregate {
public:
    explicit OEInvPos(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_CHILD_ACCESSORS(SecID, OESecID, OETAG_SECID);
    OE_GET_NUMBER(HeldInAcct, OESubAcct, OETAG_HELDINACCT);
    OE_GET_NUMBER(PosType, OEPosType, OETAG_POSTYPE);
    OE_GET_AMOUNT(Units, OETAG_UNITS);
    OE_GET_AMOUNT(UnitPrice, OETAG_UNITPRICE);
    OE_GET_AMOUNT(MarketValue, OETAG_MKTVAL);
    OE_GET_AMOUNT(AvgCostBasis, OETAG_AVGCOSTBASIS);
    OE_GET_DATE(DatePriceAsOf, OETAG_DTPRICEASOF);
    OE_GET_TEXT(Memo, OETAG_MEMO);
    OE_GET_TEXT(Memo2, OETAG_MEMO2);
    OE_CHILD_ACCESSORS(Currency, OECurrency, OETAG_CURRENCY);
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
    OE_CHILD_ACCESSORS(InvPos, OEInvPos, OETAG_INVPOS);
    OE_GET_AMOUNT(UnitsStreet, OETAG_UNITSSTREET);
    OE_GET_AMOUNT(UnitsUser, OETAG_UNITSUSER);
    OE_GET_NUMBER(ReinvDiv, unsigned short, OETAG_REINVDIV);
    OE_GET_NUMBER(ReinvCG, unsigned short, OETAG_REINVCG);
    OE_GET_NUMBER(Secured, OESecured, OETAG_SECURED);
    unsigned short SetElement(OETagID tag, const OEString& v) { return SetFromText(tag, v); }

    OEOwnedChild m_invPos;
    OEPrecisionInteger m_unitsStreet, m_unitsUser;
    unsigned short m_reinvDiv = 0, m_reinvCG = 0, m_secured = 0;
};
OE_AGGREGATE_CLASS(OEPosStock, OEPosition);
OE_AGGREGATE_CLASS(OEPosMF, OEPosition);
OE_AGGREGATE_CLASS(OEPosDebt, OEPosition);
OE_AGGREGATE_CLASS(OEPosOpt, OEPosition);
OE_AGGREGATE_CLASS(OEPosOther, OEPosition);

// INVPOSLIST: positions of the five kinds, in the order read or appended.
class OE_API OEInvPosList : public OEMixedList {
public:
    explicit OEInvPosList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_ENTRY_ACCESSORS(Position, OEPosition);
};

// INVSTMTRS: DTASOF, CURDEF, the account, the transaction and position lists, the balances, the
// open orders (INVOOLIST) and MKTGINFO.
class OE_API OEInvStmtRs : public OEAccountFromOf<OETransBase, OEInvAcctFrom, OETAG_INVACCTFROM> {
public:
    explicit OEInvStmtRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_DATE_ACCESSORS(DateAsOf, OETAG_DTASOF);
    OE_TEXT_ACCESSORS(CurDef, OETAG_CURDEF);
    OE_TEXT_ACCESSORS(MktgInfo, OETAG_MKTGINFO);
    OE_CHILD_ACCESSORS(TranList, OEInvTranList, OETAG_INVTRANLIST);
    OE_CHILD_ACCESSORS(PosList, OEInvPosList, OETAG_INVPOSLIST);
    OE_CHILD_ACCESSORS(InvBal, OEInvBal, OETAG_INVBAL);
    OE_CHILD_ACCESSORS(OOList, OEInvOOList, OETAG_INVOOLIST);

    OEDateTime m_dtAsOf;
    OEString3 m_curDef;
    OEOwnedChild m_account, m_tranList, m_posList, m_invBal, m_ooList;
    OEString360 m_mktgInfo;
};

#endif
