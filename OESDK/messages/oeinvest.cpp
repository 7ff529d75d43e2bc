#include "messages/oeinvest.h"

namespace {

// One valid row (every version, V1 only, after V1) and one field row per kind.
#define V(T)                                                                                                 \
    { OETAG_##T, OEVM_ALL, 0 }
#define V1(T)                                                                                                \
    { OETAG_##T, OEVM_V1, 0 }
#define V2(T)                                                                                                \
    { OETAG_##T, OEVM_NOTV1, 0 }
#define TEXT(C, T, m)                                                                                        \
    { OETAG_##T, OEFK_TEXT, OE_MEMBER(C, m), nullptr, nullptr }
#define AMT(C, T, m)                                                                                         \
    { OETAG_##T, OEFK_AMOUNT, OE_MEMBER(C, m), nullptr, nullptr }
#define DATE(C, T, m)                                                                                        \
    { OETAG_##T, OEFK_DATETIME, OE_MEMBER(C, m), nullptr, nullptr }
#define FLAG(C, T, m)                                                                                        \
    { OETAG_##T, OEFK_BOOL, OE_MEMBER(C, m), nullptr, nullptr }
#define COUNT(C, T, m)                                                                                       \
    { OETAG_##T, OEFK_ULONG, OE_MEMBER(C, m), nullptr, nullptr }
#define ENUM(C, T, m, kw)                                                                                    \
    { OETAG_##T, OEFK_ENUM, OE_MEMBER(C, m), &kw, nullptr }
#define CHILD(C, T, m, op)                                                                                   \
    { OETAG_##T, OEFK_CHILD, OE_MEMBER(C, m), nullptr, OE_MAKE(op) }
#define ENTRY(C, T, op)                                                                                      \
    { OETAG_##T, OEFK_LIST, OE_MEMBER(C, m_entries), nullptr, OE_MAKE(op) }
#define CURRENCIES(C)                                                                                        \
    CHILD(C, CURRENCY, m_currency, NewCurrency), CHILD(C, ORIGCURRENCY, m_currency, NewCurrency)
#define HEAD(C) CHILD(C, INVTRAN, m_invTran, NewInvTran), CHILD(C, SECID, m_secId, NewSecID)

// ---- INVACCTFROM, INCPOS, INVSTMTRQ ----
const OETagRow kAcctValid[] = {V(BROKERID), V(ACCTID)};
const OEFieldRow kAcctFields[] = {TEXT(OEInvAcctFrom, BROKERID, m_brokerId),
                                  TEXT(OEInvAcctFrom, ACCTID, m_acctId)};
const OETagRow kIncPosValid[] = {V(DTASOF), V(INCLUDE)};
const OETagRow kIncPosRequired[] = {V(INCLUDE)};
const OEFieldRow kIncPosFields[] = {DATE(OEIncPos, DTASOF, m_dtAsOf), FLAG(OEIncPos, INCLUDE, m_include)};
const OETagRow kRqValid[] = {
    V(INVACCTFROM), V(INCTRAN), V(INCOO), V(INCPOS), V(INCBAL),
};
const OETagRow kRqRequired[] = {V(INVACCTFROM), V(INCOO), V(INCPOS), V(INCBAL)};
const OEFieldRow kRqFields[] = {
    CHILD(OEInvStmtRq, INVACCTFROM, m_account, NewInvAcctFrom),
    CHILD(OEInvStmtRq, INCTRAN, m_incTran, NewIncTransaction),
    FLAG(OEInvStmtRq, INCOO, m_incOO),
    CHILD(OEInvStmtRq, INCPOS, m_incPos, NewIncPos),
    FLAG(OEInvStmtRq, INCBAL, m_incBal),
};

// ---- INVSTMTRS ----
const OETagRow kRsValid[] = {V(DTASOF),     V(CURDEF), V(INVACCTFROM), V(INVTRANLIST),
                             V(INVPOSLIST), V(INVBAL), V(INVOOLIST),   V(MKTGINFO)};
const OETagRow kRsRequired[] = {V(DTASOF), V(CURDEF), V(INVACCTFROM)};
const OEFieldRow kRsFields[] = {
    DATE(OEInvStmtRs, DTASOF, m_dtAsOf),
    TEXT(OEInvStmtRs, CURDEF, m_curDef),
    CHILD(OEInvStmtRs, INVACCTFROM, m_account, NewInvAcctFrom),
    CHILD(OEInvStmtRs, INVTRANLIST, m_tranList, NewInvTranList),
    CHILD(OEInvStmtRs, INVPOSLIST, m_posList, NewInvPosList),
    CHILD(OEInvStmtRs, INVBAL, m_invBal, NewInvBal),
    CHILD(OEInvStmtRs, INVOOLIST, m_ooList, NewInvOOList),
    TEXT(OEInvStmtRs, MKTGINFO, m_mktgInfo),
};

// ---- INVTRAN ----
const OETagRow kTranValid[] = {V(FITID),    V1(SRVRTID),      V2(SRVRTID2), V(DTTRADE),
                               V(DTSETTLE), V(REVERSALFITID), V1(MEMO),     V2(MEMO2)};
const OETagRow kTranRequired[] = {V(FITID), V(DTTRADE)};
const OEFieldRow kTranFields[] = {
    TEXT(OEInvTran, FITID, m_fitId),       TEXT(OEInvTran, SRVRTID, m_srvrTid),
    TEXT(OEInvTran, SRVRTID2, m_srvrTid2), DATE(OEInvTran, DTTRADE, m_dtTrade),
    DATE(OEInvTran, DTSETTLE, m_dtSettle), TEXT(OEInvTran, REVERSALFITID, m_reversalFitId),
    TEXT(OEInvTran, MEMO, m_memo),         TEXT(OEInvTran, MEMO2, m_memo2),
};

// ---- INVBANKTRAN ----
const OETagRow kBankTranValid[] = {V(STMTTRN), V(SUBACCTFUND)};
const OEFieldRow kBankTranFields[] = {CHILD(OEInvBankTran, STMTTRN, m_stmtTrn, NewBankStatementTx),
                                      ENUM(OEInvBankTran, SUBACCTFUND, m_subAcctFund, OEKW_SUBACCT)};

// ---- INVBUY, INVSELL ----
const OETagRow kBuyValid[] = {
    V(INVTRAN),  V(SECID),        V(UNITS),      V(UNITPRICE),   V(MARKUP),        V(COMMISSION),
    V(TAXES),    V(FEES),         V(LOAD),       V(TOTAL),       V2(REVERSALFEES), V2(REVERSALFITID),
    V(CURRENCY), V(ORIGCURRENCY), V(SUBACCTSEC), V(SUBACCTFUND),
};
const OETagRow kTradeRequired[] = {V(INVTRAN), V(SECID),      V(UNITS),      V(UNITPRICE),
                                   V(TOTAL),   V(SUBACCTSEC), V(SUBACCTFUND)};
const OEFieldRow kBuyFields[] = {
    HEAD(OEInvBuy),
    AMT(OEInvBuy, UNITS, m_units),
    AMT(OEInvBuy, UNITPRICE, m_unitPrice),
    AMT(OEInvBuy, MARKUP, m_markup),
    AMT(OEInvBuy, COMMISSION, m_commission),
    AMT(OEInvBuy, TAXES, m_taxes),
    AMT(OEInvBuy, FEES, m_fees),
    AMT(OEInvBuy, LOAD, m_load),
    AMT(OEInvBuy, TOTAL, m_total),
    AMT(OEInvBuy, REVERSALFEES, m_reversalFees),
    TEXT(OEInvBuy, REVERSALFITID, m_reversalFitId),
    CURRENCIES(OEInvBuy),
    ENUM(OEInvBuy, SUBACCTSEC, m_subAcctSec, OEKW_SUBACCT),
    ENUM(OEInvBuy, SUBACCTFUND, m_subAcctFund, OEKW_SUBACCT),
};
const OETagRow kSellValid[] = {
    V(INVTRAN),    V(SECID),        V(UNITS),         V(UNITPRICE),      V(MARKDOWN),
    V(COMMISSION), V(TAXES),        V(FEES),          V(LOAD),           V(WITHHOLDING),
    V(TAXEXEMPT),  V(TOTAL),        V2(REVERSALFEES), V2(REVERSALFITID), V(GAIN),
    V(CURRENCY),   V(ORIGCURRENCY), V(SUBACCTSEC),    V(SUBACCTFUND),
};
const OEFieldRow kSellFields[] = {
    HEAD(OEInvSell),
    AMT(OEInvSell, UNITS, m_units),
    AMT(OEInvSell, UNITPRICE, m_unitPrice),
    AMT(OEInvSell, MARKDOWN, m_markdown),
    AMT(OEInvSell, COMMISSION, m_commission),
    AMT(OEInvSell, TAXES, m_taxes),
    AMT(OEInvSell, FEES, m_fees),
    AMT(OEInvSell, LOAD, m_load),
    AMT(OEInvSell, WITHHOLDING, m_withholding),
    FLAG(OEInvSell, TAXEXEMPT, m_taxExempt),
    AMT(OEInvSell, TOTAL, m_total),
    AMT(OEInvSell, REVERSALFEES, m_reversalFees),
    TEXT(OEInvSell, REVERSALFITID, m_reversalFitId),
    AMT(OEInvSell, GAIN, m_gain),
    CURRENCIES(OEInvSell),
    ENUM(OEInvSell, SUBACCTSEC, m_subAcctSec, OEKW_SUBACCT),
    ENUM(OEInvSell, SUBACCTFUND, m_subAcctFund, OEKW_SUBACCT),
};

// ---- the buy and sell kinds ----
#define BUY(C) CHILD(C, INVBUY, m_trade, NewInvBuy)
#define SELL(C) CHILD(C, INVSELL, m_trade, NewInvSell)
const OETagRow kBuyStockValid[] = {V(INVBUY), V(BUYTYPE)};
const OEFieldRow kBuyStockFields[] = {BUY(OEBuyStock), ENUM(OEBuyStock, BUYTYPE, m_type, OEKW_BUYTYPE)};
const OETagRow kBuyMFValid[] = {V(INVBUY), V(BUYTYPE), V(RELFITID)};
const OETagRow kBuyMFRequired[] = {V(INVBUY), V(BUYTYPE)};
const OEFieldRow kBuyMFFields[] = {BUY(OEBuyMF), ENUM(OEBuyMF, BUYTYPE, m_type, OEKW_BUYTYPE),
                                   TEXT(OEBuyMF, RELFITID, m_relFitId)};
const OETagRow kBuyDebtValid[] = {V(INVBUY), V(ACCRDINT)};
const OETagRow kBuyOnly[] = {V(INVBUY)};
const OEFieldRow kBuyDebtFields[] = {BUY(OEBuyDebt), AMT(OEBuyDebt, ACCRDINT, m_accrdInt)};
const OETagRow kBuyOptValid[] = {V(INVBUY), V(OPTBUYTYPE), V(SHPERCTRCT)};
const OEFieldRow kBuyOptFields[] = {BUY(OEBuyOpt), ENUM(OEBuyOpt, OPTBUYTYPE, m_type, OEKW_OPTBUYTYPE),
                                    COUNT(OEBuyOpt, SHPERCTRCT, m_shPerCtrct)};
const OETagRow kBuyOtherValid[] = {V(INVBUY), V2(BUYTYPE)};
const OEFieldRow kBuyOtherFields[] = {BUY(OEBuyOther), ENUM(OEBuyOther, BUYTYPE, m_type, OEKW_BUYTYPE)};

const OETagRow kSellStockValid[] = {V(INVSELL), V(SELLTYPE)};
const OEFieldRow kSellStockFields[] = {SELL(OESellStock), ENUM(OESellStock, SELLTYPE, m_type, OEKW_SELLTYPE)};
const OETagRow kSellMFValid[] = {V(INVSELL), V(SELLTYPE), V(AVGCOSTBASIS), V(RELFITID)};
const OETagRow kSellMFRequired[] = {V(INVSELL), V(SELLTYPE)};
const OEFieldRow kSellMFFields[] = {SELL(OESellMF), ENUM(OESellMF, SELLTYPE, m_type, OEKW_SELLTYPE),
                                    AMT(OESellMF, AVGCOSTBASIS, m_avgCostBasis),
                                    TEXT(OESellMF, RELFITID, m_relFitId)};
const OETagRow kSellDebtValid[] = {V(INVSELL), V(SELLREASON), V(ACCRDINT)};
const OETagRow kSellDebtRequired[] = {V(INVSELL), V(SELLREASON)};
const OEFieldRow kSellDebtFields[] = {SELL(OESellDebt), ENUM(OESellDebt, SELLREASON, m_type, OEKW_SELLREASON),
                                      AMT(OESellDebt, ACCRDINT, m_accrdInt)};
const OETagRow kSellOptValid[] = {V(INVSELL),  V(OPTSELLTYPE), V(SHPERCTRCT),
                                  V(RELFITID), V(RELTYPE),     V(SECURED)};
const OETagRow kSellOptRequired[] = {V(INVSELL), V(OPTSELLTYPE), V(SHPERCTRCT)};
const OEFieldRow kSellOptFields[] = {
    SELL(OESellOpt),
    ENUM(OESellOpt, OPTSELLTYPE, m_type, OEKW_OPTSELLTYPE),
    COUNT(OESellOpt, SHPERCTRCT, m_shPerCtrct),
    TEXT(OESellOpt, RELFITID, m_relFitId),
    ENUM(OESellOpt, RELTYPE, m_relType, OEKW_RELTYPE),
    ENUM(OESellOpt, SECURED, m_secured, OEKW_SECURED),
};
const OETagRow kSellOtherValid[] = {V(INVSELL), V2(SELLTYPE)};
const OETagRow kSellOnly[] = {V(INVSELL)};
const OEFieldRow kSellOtherFields[] = {SELL(OESellOther), ENUM(OESellOther, SELLTYPE, m_type, OEKW_SELLTYPE)};

// ---- the other transactions ----
typedef OEOtherInvestmentTx X;
const OETagRow kIncomeValid[] = {
    V(INVTRAN),     V(SECID),     V(INCOMETYPE),  V(TOTAL),    V(SUBACCTSEC),
    V(SUBACCTFUND), V(TAXEXEMPT), V(WITHHOLDING), V(CURRENCY), V(ORIGCURRENCY),
};
const OETagRow kIncomeRequired[] = {V(INVTRAN), V(SECID),      V(INCOMETYPE),
                                    V(TOTAL),   V(SUBACCTSEC), V(SUBACCTFUND)};
const OEFieldRow kIncomeFields[] = {
    HEAD(X),
    ENUM(X, INCOMETYPE, m_incomeType, OEKW_INCOMETYPE),
    AMT(X, TOTAL, m_total),
    ENUM(X, SUBACCTSEC, m_subAcctSec, OEKW_SUBACCT),
    ENUM(X, SUBACCTFUND, m_subAcctFund, OEKW_SUBACCT),
    FLAG(X, TAXEXEMPT, m_taxExempt),
    AMT(X, WITHHOLDING, m_withholding),
    CURRENCIES(X),
};
const OETagRow kReinvestValid[] = {
    V(INVTRAN),    V(SECID), V(INCOMETYPE), V(TOTAL), V(SUBACCTSEC), V(UNITS),    V(UNITPRICE),
    V(COMMISSION), V(TAXES), V(FEES),       V(LOAD),  V(TAXEXEMPT),  V(CURRENCY), V(ORIGCURRENCY),
};
const OETagRow kReinvestRequired[] = {V(INVTRAN),    V(SECID), V(INCOMETYPE), V(TOTAL),
                                      V(SUBACCTSEC), V(UNITS), V(UNITPRICE)};
const OEFieldRow kReinvestFields[] = {
    HEAD(X),
    ENUM(X, INCOMETYPE, m_incomeType, OEKW_INCOMETYPE),
    AMT(X, TOTAL, m_total),
    ENUM(X, SUBACCTSEC, m_subAcctSec, OEKW_SUBACCT),
    AMT(X, UNITS, m_units),
    AMT(X, UNITPRICE, m_unitPrice),
    AMT(X, COMMISSION, m_commission),
    AMT(X, TAXES, m_taxes),
    AMT(X, FEES, m_fees),
    AMT(X, LOAD, m_load),
    FLAG(X, TAXEXEMPT, m_taxExempt),
    CURRENCIES(X),
};
const OETagRow kRetOfCapValid[] = {
    V(INVTRAN), V(SECID), V(TOTAL), V(SUBACCTSEC), V(SUBACCTFUND), V(CURRENCY), V(ORIGCURRENCY),
};
const OETagRow kRetOfCapRequired[] = {V(INVTRAN), V(SECID), V(TOTAL), V(SUBACCTSEC), V(SUBACCTFUND)};
const OEFieldRow kRetOfCapFields[] = {
    HEAD(X),
    AMT(X, TOTAL, m_total),
    ENUM(X, SUBACCTSEC, m_subAcctSec, OEKW_SUBACCT),
    ENUM(X, SUBACCTFUND, m_subAcctFund, OEKW_SUBACCT),
    CURRENCIES(X),
};
// INVEXPENSE has the same elements as RETOFCAP, in the same order.
const OETagRow kSplitValid[] = {
    V(INVTRAN),     V(SECID),    V(SUBACCTSEC),   V(OLDUNITS), V(NEWUNITS),    V(NUMERATOR),
    V(DENOMINATOR), V(CURRENCY), V(ORIGCURRENCY), V(FRACCASH), V(SUBACCTFUND),
};
const OETagRow kSplitRequired[] = {V(INVTRAN),  V(SECID),     V(SUBACCTSEC), V(OLDUNITS),
                                   V(NEWUNITS), V(NUMERATOR), V(DENOMINATOR)};
const OEFieldRow kSplitFields[] = {
    HEAD(X),
    ENUM(X, SUBACCTSEC, m_subAcctSec, OEKW_SUBACCT),
    AMT(X, OLDUNITS, m_oldUnits),
    AMT(X, NEWUNITS, m_newUnits),
    AMT(X, NUMERATOR, m_numerator),
    AMT(X, DENOMINATOR, m_denominator),
    CURRENCIES(X),
    AMT(X, FRACCASH, m_fracCash),
    ENUM(X, SUBACCTFUND, m_subAcctFund, OEKW_SUBACCT),
};
const OETagRow kTransferValid[] = {
    V(INVTRAN), V(SECID),       V(SUBACCTSEC),   V(UNITS),     V(TFERACTION),
    V(POSTYPE), V(INVACCTFROM), V(AVGCOSTBASIS), V(UNITPRICE), V(DTPURCHASE),
};
const OETagRow kTransferRequired[] = {V(INVTRAN), V(SECID),      V(SUBACCTSEC),
                                      V(UNITS),   V(TFERACTION), V(POSTYPE)};
const OEFieldRow kTransferFields[] = {
    HEAD(X),
    ENUM(X, SUBACCTSEC, m_subAcctSec, OEKW_SUBACCT),
    AMT(X, UNITS, m_units),
    ENUM(X, TFERACTION, m_action, OEKW_TFERACTION),
    ENUM(X, POSTYPE, m_posType, OEKW_POSTYPE),
    CHILD(X, INVACCTFROM, m_invAcctFrom, NewInvAcctFrom),
    AMT(X, AVGCOSTBASIS, m_avgCostBasis),
    AMT(X, UNITPRICE, m_unitPrice),
    DATE(X, DTPURCHASE, m_dtPurchase),
};
const OETagRow kJrnlFundValid[] = {V(INVTRAN), V(SUBACCTTO), V(SUBACCTFROM), V(TOTAL)};
const OEFieldRow kJrnlFundFields[] = {
    CHILD(X, INVTRAN, m_invTran, NewInvTran),
    ENUM(X, SUBACCTTO, m_subAcctTo, OEKW_SUBACCT),
    ENUM(X, SUBACCTFROM, m_subAcctFrom, OEKW_SUBACCT),
    AMT(X, TOTAL, m_total),
};
const OETagRow kJrnlSecValid[] = {V(INVTRAN), V(SECID), V(SUBACCTTO), V(SUBACCTFROM), V(UNITS)};
const OEFieldRow kJrnlSecFields[] = {
    HEAD(X),
    ENUM(X, SUBACCTTO, m_subAcctTo, OEKW_SUBACCT),
    ENUM(X, SUBACCTFROM, m_subAcctFrom, OEKW_SUBACCT),
    AMT(X, UNITS, m_units),
};
const OETagRow kMarginValid[] = {V(INVTRAN), V(TOTAL), V(SUBACCTFUND), V(CURRENCY), V(ORIGCURRENCY)};
const OETagRow kMarginRequired[] = {V(INVTRAN), V(TOTAL), V(SUBACCTFUND)};
const OEFieldRow kMarginFields[] = {
    CHILD(X, INVTRAN, m_invTran, NewInvTran),
    AMT(X, TOTAL, m_total),
    ENUM(X, SUBACCTFUND, m_subAcctFund, OEKW_SUBACCT),
    CURRENCIES(X),
};
const OETagRow kClosureValid[] = {V(INVTRAN),    V(SECID),      V(OPTACTION), V(UNITS),
                                  V(SHPERCTRCT), V(SUBACCTSEC), V(RELFITID),  V(GAIN)};
const OETagRow kClosureRequired[] = {V(INVTRAN), V(SECID),      V(OPTACTION),
                                     V(UNITS),   V(SHPERCTRCT), V(SUBACCTSEC)};
const OEFieldRow kClosureFields[] = {
    HEAD(X),
    ENUM(X, OPTACTION, m_action, OEKW_OPTACTION),
    AMT(X, UNITS, m_units),
    COUNT(X, SHPERCTRCT, m_shPerCtrct),
    ENUM(X, SUBACCTSEC, m_subAcctSec, OEKW_SUBACCT),
    TEXT(X, RELFITID, m_relFitId),
    AMT(X, GAIN, m_gain),
};

// ---- INVTRANLIST ----
typedef OEInvTranList L;
const OETagRow kTranListValid[] = {
    V(DTSTART),  V(DTEND),          V(INVBANKTRAN), V(BUYDEBT),  V(BUYMF),      V(BUYOPT),
    V(BUYOTHER), V(BUYSTOCK),       V(CLOSUREOPT),  V(INCOME),   V(INVEXPENSE), V(JRNLFUND),
    V(JRNLSEC),  V(MARGININTEREST), V(REINVEST),    V(RETOFCAP), V(SELLDEBT),   V(SELLMF),
    V(SELLOPT),  V(SELLOTHER),      V(SELLSTOCK),   V(SPLIT),    V(TRANSFER)};
const OETagRow kTranListRequired[] = {V(DTSTART), V(DTEND)};
const OEFieldRow kTranListFields[] = {
    DATE(L, DTSTART, m_dtStart),
    DATE(L, DTEND, m_dtEnd),
    ENTRY(L, INVBANKTRAN, NewInvBankTran),
    ENTRY(L, BUYDEBT, NewBuyDebt),
    ENTRY(L, BUYMF, NewBuyMF),
    ENTRY(L, BUYOPT, NewBuyOpt),
    ENTRY(L, BUYOTHER, NewBuyOther),
    ENTRY(L, BUYSTOCK, NewBuyStock),
    ENTRY(L, CLOSUREOPT, NewClosureOpt),
    ENTRY(L, INCOME, NewIncome),
    ENTRY(L, INVEXPENSE, NewInvExpense),
    ENTRY(L, JRNLFUND, NewJrnlFund),
    ENTRY(L, JRNLSEC, NewJrnlSec),
    ENTRY(L, MARGININTEREST, NewMarginInterest),
    ENTRY(L, REINVEST, NewReinvest),
    ENTRY(L, RETOFCAP, NewRetOfCap),
    ENTRY(L, SELLDEBT, NewSellDebt),
    ENTRY(L, SELLMF, NewSellMF),
    ENTRY(L, SELLOPT, NewSellOpt),
    ENTRY(L, SELLOTHER, NewSellOther),
    ENTRY(L, SELLSTOCK, NewSellStock),
    ENTRY(L, SPLIT, NewSplit),
    ENTRY(L, TRANSFER, NewTransfer),
};

// ---- BALLIST, INVBAL ----
const OETagRow kBalListValid[] = {V(BAL)};
const OEFieldRow kBalListFields[] = {
    {OETAG_BAL, OEFK_LIST, OE_MEMBER(OEBalList, m_bal), nullptr, OE_MAKE(NewBalance)}};
const OETagRow kInvBalValid[] = {V(AVAILCASH), V(MARGINBALANCE), V(SHORTBALANCE), V(BUYPOWER), V(BALLIST)};
const OETagRow kInvBalRequired[] = {V(AVAILCASH), V(MARGINBALANCE), V(SHORTBALANCE)};
const OEFieldRow kInvBalFields[] = {
    AMT(OEInvBal, AVAILCASH, m_availCash),           AMT(OEInvBal, MARGINBALANCE, m_marginBalance),
    AMT(OEInvBal, SHORTBALANCE, m_shortBalance),     AMT(OEInvBal, BUYPOWER, m_buyPower),
    CHILD(OEInvBal, BALLIST, m_balList, NewBalList),
};

// ---- INVPOS, the position kinds, INVPOSLIST ----
const OETagRow kPosValid[] = {
    V(SECID),         V(HELDINACCT),  V(POSTYPE),  V(UNITS), V(UNITPRICE), V(MKTVAL),
    V2(AVGCOSTBASIS), V(DTPRICEASOF), V(CURRENCY), V1(MEMO), V2(MEMO2),
};
const OETagRow kPosRequired[] = {V(SECID),     V(HELDINACCT), V(POSTYPE),    V(UNITS),
                                 V(UNITPRICE), V(MKTVAL),     V(DTPRICEASOF)};
const OEFieldRow kPosFields[] = {
    CHILD(OEInvPos, SECID, m_secId, NewSecID),
    ENUM(OEInvPos, HELDINACCT, m_heldInAcct, OEKW_SUBACCT),
    ENUM(OEInvPos, POSTYPE, m_posType, OEKW_POSTYPE),
    AMT(OEInvPos, UNITS, m_units),
    AMT(OEInvPos, UNITPRICE, m_unitPrice),
    AMT(OEInvPos, MKTVAL, m_mktVal),
    AMT(OEInvPos, AVGCOSTBASIS, m_avgCostBasis),
    DATE(OEInvPos, DTPRICEASOF, m_dtPriceAsOf),
    CHILD(OEInvPos, CURRENCY, m_currency, NewCurrency),
    TEXT(OEInvPos, MEMO, m_memo),
    TEXT(OEInvPos, MEMO2, m_memo2),
};
typedef OEPosition P;
const OETagRow kInvPosOnly[] = {V(INVPOS)};
const OETagRow kPosStockValid[] = {V(INVPOS), V(UNITSSTREET), V(UNITSUSER), V(REINVDIV)};
const OETagRow kPosMFValid[] = {V(INVPOS), V(UNITSSTREET), V(UNITSUSER), V(REINVDIV), V(REINVCG)};
const OETagRow kPosOptValid[] = {V(INVPOS), V(SECURED)};
const OEFieldRow kPosMFFields[] = {
    CHILD(P, INVPOS, m_invPos, NewInvPos), AMT(P, UNITSSTREET, m_unitsStreet), AMT(P, UNITSUSER, m_unitsUser),
    FLAG(P, REINVDIV, m_reinvDiv),         FLAG(P, REINVCG, m_reinvCG),
};
const OEFieldRow kPosOptFields[] = {CHILD(P, INVPOS, m_invPos, NewInvPos),
                                    ENUM(P, SECURED, m_secured, OEKW_SECURED)};
const OETagRow kPosListValid[] = {V(POSDEBT), V(POSMF), V(POSOPT), V(POSOTHER), V(POSSTOCK)};
const OEFieldRow kPosListFields[] = {
    ENTRY(OEInvPosList, POSDEBT, NewPosDebt),   ENTRY(OEInvPosList, POSMF, NewPosMF),
    ENTRY(OEInvPosList, POSOPT, NewPosOpt),     ENTRY(OEInvPosList, POSOTHER, NewPosOther),
    ENTRY(OEInvPosList, POSSTOCK, NewPosStock),
};

// A descriptor whose field rows are the first `n` rows of a longer table: the POSSTOCK rows are
// the POSMF rows without REINVCG, POSDEBT and POSOTHER have only INVPOS.
#define OE_DESC_PREFIX(tag, valid, required, fields, n)                                                      \
    OEAggregateDesc {                                                                                        \
        tag, valid, static_cast<unsigned short>(sizeof(valid) / sizeof(valid[0])), required,                 \
            static_cast<unsigned short>(sizeof(required) / sizeof(required[0])), fields, n                   \
    }

const OEAggregateDesc kBalListDesc = OE_DESC_NO_REQUIRED(OETAG_BALLIST, kBalListValid, kBalListFields);
const OEAggregateDesc kPosStockDesc =
    OE_DESC_PREFIX(OETAG_POSSTOCK, kPosStockValid, kInvPosOnly, kPosMFFields, 4);
const OEAggregateDesc kPosDebtDesc = OE_DESC_PREFIX(OETAG_POSDEBT, kInvPosOnly, kInvPosOnly, kPosMFFields, 1);
const OEAggregateDesc kPosOtherDesc =
    OE_DESC_PREFIX(OETAG_POSOTHER, kInvPosOnly, kInvPosOnly, kPosMFFields, 1);
const OEAggregateDesc kPosListDesc = OE_DESC_NO_REQUIRED(OETAG_INVPOSLIST, kPosListValid, kPosListFields);

} // namespace

OE_AGGREGATE_DEFINE_TABLES(OEInvAcctFrom, OEAggregate, OETAG_INVACCTFROM, kAcctValid, kAcctValid, kAcctFields)
OE_AGGREGATE_DEFINE_TABLES(OEIncPos, OEAggregate, OETAG_INCPOS, kIncPosValid, kIncPosRequired, kIncPosFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvStmtRq, OEAccountFromOf, OETAG_INVSTMTRQ, kRqValid, kRqRequired, kRqFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvStmtRs, OEAccountFromOf, OETAG_INVSTMTRS, kRsValid, kRsRequired, kRsFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvTran, OEAggregate, OETAG_INVTRAN, kTranValid, kTranRequired, kTranFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvBankTran, OEInvestmentTx, OETAG_INVBANKTRAN, kBankTranValid, kBankTranValid,
                           kBankTranFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvBuy, OEInvestmentTx, OETAG_INVBUY, kBuyValid, kTradeRequired, kBuyFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvSell, OEInvestmentTx, OETAG_INVSELL, kSellValid, kTradeRequired, kSellFields)
OE_AGGREGATE_DEFINE_TABLES(OEBuyStock, OEBuyTrade, OETAG_BUYSTOCK, kBuyStockValid, kBuyStockValid,
                           kBuyStockFields)
OE_AGGREGATE_DEFINE_TABLES(OEBuyMF, OEBuyTrade, OETAG_BUYMF, kBuyMFValid, kBuyMFRequired, kBuyMFFields)
OE_AGGREGATE_DEFINE_TABLES(OEBuyDebt, OEBuyTrade, OETAG_BUYDEBT, kBuyDebtValid, kBuyOnly, kBuyDebtFields)
OE_AGGREGATE_DEFINE_TABLES(OEBuyOpt, OEBuyTrade, OETAG_BUYOPT, kBuyOptValid, kBuyOptValid, kBuyOptFields)
OE_AGGREGATE_DEFINE_TABLES(OEBuyOther, OEBuyTrade, OETAG_BUYOTHER, kBuyOtherValid, kBuyOnly, kBuyOtherFields)
OE_AGGREGATE_DEFINE_TABLES(OESellStock, OESellTrade, OETAG_SELLSTOCK, kSellStockValid, kSellStockValid,
                           kSellStockFields)
OE_AGGREGATE_DEFINE_TABLES(OESellMF, OESellTrade, OETAG_SELLMF, kSellMFValid, kSellMFRequired, kSellMFFields)
OE_AGGREGATE_DEFINE_TABLES(OESellDebt, OESellTrade, OETAG_SELLDEBT, kSellDebtValid, kSellDebtRequired,
                           kSellDebtFields)
OE_AGGREGATE_DEFINE_TABLES(OESellOpt, OESellTrade, OETAG_SELLOPT, kSellOptValid, kSellOptRequired,
                           kSellOptFields)
OE_AGGREGATE_DEFINE_TABLES(OESellOther, OESellTrade, OETAG_SELLOTHER, kSellOtherValid, kSellOnly,
                           kSellOtherFields)
OE_AGGREGATE_DEFINE_TABLES(OEIncome, OEOtherInvestmentTx, OETAG_INCOME, kIncomeValid, kIncomeRequired,
                           kIncomeFields)
OE_AGGREGATE_DEFINE_TABLES(OEReinvest, OEOtherInvestmentTx, OETAG_REINVEST, kReinvestValid, kReinvestRequired,
                           kReinvestFields)
OE_AGGREGATE_DEFINE_TABLES(OERetOfCap, OEOtherInvestmentTx, OETAG_RETOFCAP, kRetOfCapValid, kRetOfCapRequired,
                           kRetOfCapFields)
OE_AGGREGATE_DEFINE_TABLES(OESplit, OEOtherInvestmentTx, OETAG_SPLIT, kSplitValid, kSplitRequired,
                           kSplitFields)
OE_AGGREGATE_DEFINE_TABLES(OETransfer, OEOtherInvestmentTx, OETAG_TRANSFER, kTransferValid, kTransferRequired,
                           kTransferFields)
OE_AGGREGATE_DEFINE_TABLES(OEJrnlFund, OEOtherInvestmentTx, OETAG_JRNLFUND, kJrnlFundValid, kJrnlFundValid,
                           kJrnlFundFields)
OE_AGGREGATE_DEFINE_TABLES(OEJrnlSec, OEOtherInvestmentTx, OETAG_JRNLSEC, kJrnlSecValid, kJrnlSecValid,
                           kJrnlSecFields)
OE_AGGREGATE_DEFINE_TABLES(OEMarginInterest, OEOtherInvestmentTx, OETAG_MARGININTEREST, kMarginValid,
                           kMarginRequired, kMarginFields)
OE_AGGREGATE_DEFINE_TABLES(OEClosureOpt, OEOtherInvestmentTx, OETAG_CLOSUREOPT, kClosureValid,
                           kClosureRequired, kClosureFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvExpense, OEOtherInvestmentTx, OETAG_INVEXPENSE, kRetOfCapValid,
                           kRetOfCapRequired, kRetOfCapFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvTranList, OEDateRangeOf, OETAG_INVTRANLIST, kTranListValid, kTranListRequired,
                           kTranListFields)
OE_AGGREGATE_DEFINE(OEBalList, OEAggregate, kBalListDesc, OETAG_BALLIST)
OE_AGGREGATE_DEFINE_TABLES(OEInvBal, OEAggregate, OETAG_INVBAL, kInvBalValid, kInvBalRequired, kInvBalFields)
OE_AGGREGATE_DEFINE_TABLES(OEInvPos, OEAggregate, OETAG_INVPOS, kPosValid, kPosRequired, kPosFields)
OE_AGGREGATE_DEFINE(OEPosStock, OEPosition, kPosStockDesc, OETAG_POSSTOCK)
OE_AGGREGATE_DEFINE_TABLES(OEPosMF, OEPosition, OETAG_POSMF, kPosMFValid, kInvPosOnly, kPosMFFields)
OE_AGGREGATE_DEFINE(OEPosDebt, OEPosition, kPosDebtDesc, OETAG_POSDEBT)
OE_AGGREGATE_DEFINE_TABLES(OEPosOpt, OEPosition, OETAG_POSOPT, kPosOptValid, kInvPosOnly, kPosOptFields)
OE_AGGREGATE_DEFINE(OEPosOther, OEPosition, kPosOtherDesc, OETAG_POSOTHER)
OE_AGGREGATE_DEFINE(OEInvPosList, OEMixedList, kPosListDesc, OETAG_INVPOSLIST)

unsigned short OEInvStmtRq::SetIncludeFlag(OETagID tag, unsigned short v) {
    const OEFieldRow* row = FindRow(tag);
    if (!row || row->m_kind != OEFK_BOOL) return 0;
    return SetNumber(tag, v);
}

unsigned short OEInvestmentTx::SetCurrency(OECurrency* currency) {
    if (!currency) return SetChildObj(OETAG_CURRENCY, nullptr);
    return SetChildObj(currency->GetType() == OETAG_ORIGCURRENCY ? OETAG_ORIGCURRENCY : OETAG_CURRENCY,
                       currency);
}
