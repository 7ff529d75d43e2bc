#include "messages/oeopenorder.h"

namespace {

// ---- OO ----
const OETagRow kOOValid[] = {
    {OETAG_FITID, OEVM_ALL, 0},    {OETAG_SRVRTID, OEVM_V1, 0},     {OETAG_SRVRTID2, OEVM_NOTV1, 0},
    {OETAG_SECID, OEVM_ALL, 0},    {OETAG_DTPLACED, OEVM_ALL, 0},   {OETAG_UNITS, OEVM_ALL, 0},
    {OETAG_SUBACCT, OEVM_ALL, 0},  {OETAG_DURATION, OEVM_ALL, 0},   {OETAG_RESTRICTION, OEVM_ALL, 0},
    {OETAG_MINUNITS, OEVM_ALL, 0}, {OETAG_LIMITPRICE, OEVM_ALL, 0}, {OETAG_STOPPRICE, OEVM_ALL, 0},
    {OETAG_MEMO, OEVM_V1, 0},      {OETAG_MEMO2, OEVM_NOTV1, 0},    {OETAG_CURRENCY, OEVM_ALL, 0}};
const OETagRow kOORequired[] = {{OETAG_FITID, OEVM_ALL, 0},      {OETAG_SECID, OEVM_ALL, 0},
                                {OETAG_DTPLACED, OEVM_ALL, 0},   {OETAG_UNITS, OEVM_ALL, 0},
                                {OETAG_SUBACCT, OEVM_ALL, 0},    {OETAG_DURATION, OEVM_ALL, 0},
                                {OETAG_RESTRICTION, OEVM_ALL, 0}};
const OEFieldRow kOOFields[] = {
    {OETAG_FITID, OEFK_TEXT, OE_MEMBER(OEOO, m_fitId), nullptr, nullptr},
    {OETAG_SRVRTID, OEFK_TEXT, OE_MEMBER(OEOO, m_srvrTId), nullptr, nullptr},
    {OETAG_SRVRTID2, OEFK_TEXT, OE_MEMBER(OEOO, m_srvrTId2), nullptr, nullptr},
    {OETAG_SECID, OEFK_CHILD, OE_MEMBER(OEOO, m_secId), nullptr, OE_MAKE(NewSecID)},
    {OETAG_DTPLACED, OEFK_DATETIME, OE_MEMBER(OEOO, m_dtPlaced), nullptr, nullptr},
    {OETAG_UNITS, OEFK_AMOUNT, OE_MEMBER(OEOO, m_units), nullptr, nullptr},
    {OETAG_SUBACCT, OEFK_ENUM, OE_MEMBER(OEOO, m_subAcct), &OEKW_SUBACCT, nullptr},
    {OETAG_DURATION, OEFK_ENUM, OE_MEMBER(OEOO, m_duration), &OEKW_DURATION, nullptr},
    {OETAG_RESTRICTION, OEFK_ENUM, OE_MEMBER(OEOO, m_restriction), &OEKW_RESTRICTION, nullptr},
    {OETAG_MINUNITS, OEFK_AMOUNT, OE_MEMBER(OEOO, m_minUnits), nullptr, nullptr},
    {OETAG_LIMITPRICE, OEFK_AMOUNT, OE_MEMBER(OEOO, m_limitPrice), nullptr, nullptr},
    {OETAG_STOPPRICE, OEFK_AMOUNT, OE_MEMBER(OEOO, m_stopPrice), nullptr, nullptr},
    {OETAG_MEMO, OEFK_TEXT, OE_MEMBER(OEOO, m_memo), nullptr, nullptr},
    {OETAG_MEMO2, OEFK_TEXT, OE_MEMBER(OEOO, m_memo2), nullptr, nullptr},
    {OETAG_CURRENCY, OEFK_CHILD, OE_MEMBER(OEOO, m_currency), nullptr, OE_MAKE(NewCurrency)},
};

// Rows the kinds of order share; every member lives in OEOpenOrder.
#define OE_OO_ROW                                                                                            \
    { OETAG_OO, OEFK_CHILD, OE_MEMBER(OEOpenOrder, m_oo), nullptr, OE_MAKE(NewOO) }
#define OE_UNITTYPE_ROW                                                                                      \
    { OETAG_UNITTYPE, OEFK_ENUM, OE_MEMBER(OEOpenOrder, m_unitType), &OEKW_UNITTYPE, nullptr }
#define OE_BUYTYPE_ROW                                                                                       \
    { OETAG_BUYTYPE, OEFK_ENUM, OE_MEMBER(OEOpenOrder, m_buyType), &OEKW_BUYTYPE, nullptr }
#define OE_SELLTYPE_ROW                                                                                      \
    { OETAG_SELLTYPE, OEFK_ENUM, OE_MEMBER(OEOpenOrder, m_sellType), &OEKW_SELLTYPE, nullptr }

// Every element of every kind is required, apart from DTAUCTION; so for most kinds the one table
// serves as valid and required table.
const OETagRow kOOOnly[] = {{OETAG_OO, OEVM_ALL, 0}};
const OEFieldRow kOOOnlyFields[] = {OE_OO_ROW};

// ---- OOBUYDEBT ----
const OETagRow kBuyDebtValid[] = {
    {OETAG_OO, OEVM_ALL, 0}, {OETAG_AUCTION, OEVM_ALL, 0}, {OETAG_DTAUCTION, OEVM_ALL, 0}};
const OEFieldRow kBuyDebtFields[] = {
    OE_OO_ROW,
    {OETAG_AUCTION, OEFK_BOOL, OE_MEMBER(OEOOBuyDebt, m_auction), nullptr, nullptr},
    {OETAG_DTAUCTION, OEFK_DATETIME, OE_MEMBER(OEOOBuyDebt, m_dtAuction), nullptr, nullptr},
};

// ---- OOBUYMF ----
const OETagRow kBuyMFValid[] = {
    {OETAG_OO, OEVM_ALL, 0}, {OETAG_BUYTYPE, OEVM_ALL, 0}, {OETAG_UNITTYPE, OEVM_ALL, 0}};
const OEFieldRow kBuyMFFields[] = {OE_OO_ROW, OE_BUYTYPE_ROW, OE_UNITTYPE_ROW};

// ---- OOBUYOPT ----
const OETagRow kBuyOptValid[] = {{OETAG_OO, OEVM_ALL, 0}, {OETAG_OPTBUYTYPE, OEVM_ALL, 0}};
const OEFieldRow kBuyOptFields[] = {
    OE_OO_ROW,
    {OETAG_OPTBUYTYPE, OEFK_ENUM, OE_MEMBER(OEOOBuyOpt, m_optBuyType), &OEKW_OPTBUYTYPE, nullptr},
};

// ---- OOBUYOTHER, OOSELLOTHER ----
const OETagRow kOtherValid[] = {{OETAG_OO, OEVM_ALL, 0}, {OETAG_UNITTYPE, OEVM_ALL, 0}};
const OEFieldRow kOtherFields[] = {OE_OO_ROW, OE_UNITTYPE_ROW};

// ---- OOBUYSTOCK ----
const OETagRow kBuyStockValid[] = {{OETAG_OO, OEVM_ALL, 0}, {OETAG_BUYTYPE, OEVM_ALL, 0}};
const OEFieldRow kBuyStockFields[] = {OE_OO_ROW, OE_BUYTYPE_ROW};

// ---- OOSELLMF ----
const OETagRow kSellMFValid[] = {{OETAG_OO, OEVM_ALL, 0},
                                 {OETAG_SELLTYPE, OEVM_ALL, 0},
                                 {OETAG_UNITTYPE, OEVM_ALL, 0},
                                 {OETAG_SELLALL, OEVM_ALL, 0}};
const OEFieldRow kSellMFFields[] = {
    OE_OO_ROW,
    OE_SELLTYPE_ROW,
    OE_UNITTYPE_ROW,
    {OETAG_SELLALL, OEFK_BOOL, OE_MEMBER(OEOOSellMF, m_sellAll), nullptr, nullptr},
};

// ---- OOSELLOPT ----
const OETagRow kSellOptValid[] = {{OETAG_OO, OEVM_ALL, 0}, {OETAG_OPTSELLTYPE, OEVM_ALL, 0}};
const OEFieldRow kSellOptFields[] = {
    OE_OO_ROW,
    {OETAG_OPTSELLTYPE, OEFK_ENUM, OE_MEMBER(OEOOSellOpt, m_optSellType), &OEKW_OPTSELLTYPE, nullptr},
};

// ---- OOSELLSTOCK ----
const OETagRow kSellStockValid[] = {{OETAG_OO, OEVM_ALL, 0}, {OETAG_SELLTYPE, OEVM_ALL, 0}};
const OEFieldRow kSellStockFields[] = {OE_OO_ROW, OE_SELLTYPE_ROW};

// ---- OOSWITCHMF ----
const OETagRow kSwitchValid[] = {{OETAG_OO, OEVM_ALL, 0},
                                 {OETAG_SECID, OEVM_ALL, 0},
                                 {OETAG_UNITTYPE, OEVM_ALL, 0},
                                 {OETAG_SWITCHALL, OEVM_ALL, 0}};
const OEFieldRow kSwitchFields[] = {
    OE_OO_ROW,
    {OETAG_SECID, OEFK_CHILD, OE_MEMBER(OEOOSwitchMF, m_secId), nullptr, OE_MAKE(NewSecID)},
    OE_UNITTYPE_ROW,
    {OETAG_SWITCHALL, OEFK_BOOL, OE_MEMBER(OEOOSwitchMF, m_switchAll), nullptr, nullptr},
};

// ---- INVOOLIST ----
// The eleven rows share one list; each row names the factory operation of its kind.
const OETagRow kListValid[] = {
    {OETAG_OOBUYDEBT, OEVM_ALL, 0},   {OETAG_OOBUYMF, OEVM_ALL, 0},    {OETAG_OOBUYOPT, OEVM_ALL, 0},
    {OETAG_OOBUYOTHER, OEVM_ALL, 0},  {OETAG_OOBUYSTOCK, OEVM_ALL, 0}, {OETAG_OOSELLDEBT, OEVM_ALL, 0},
    {OETAG_OOSELLMF, OEVM_ALL, 0},    {OETAG_OOSELLOPT, OEVM_ALL, 0},  {OETAG_OOSELLOTHER, OEVM_ALL, 0},
    {OETAG_OOSELLSTOCK, OEVM_ALL, 0}, {OETAG_OOSWITCHMF, OEVM_ALL, 0}};
#define OE_ORDER_ROW(tag, op)                                                                                \
    { tag, OEFK_LIST, OE_MEMBER(OEInvOOList, m_entries), nullptr, OE_MAKE(op) }
const OEFieldRow kListFields[] = {
    OE_ORDER_ROW(OETAG_OOBUYDEBT, NewOOBuyDebt),     OE_ORDER_ROW(OETAG_OOBUYMF, NewOOBuyMF),
    OE_ORDER_ROW(OETAG_OOBUYOPT, NewOOBuyOpt),       OE_ORDER_ROW(OETAG_OOBUYOTHER, NewOOBuyOther),
    OE_ORDER_ROW(OETAG_OOBUYSTOCK, NewOOBuyStock),   OE_ORDER_ROW(OETAG_OOSELLDEBT, NewOOSellDebt),
    OE_ORDER_ROW(OETAG_OOSELLMF, NewOOSellMF),       OE_ORDER_ROW(OETAG_OOSELLOPT, NewOOSellOpt),
    OE_ORDER_ROW(OETAG_OOSELLOTHER, NewOOSellOther), OE_ORDER_ROW(OETAG_OOSELLSTOCK, NewOOSellStock),
    OE_ORDER_ROW(OETAG_OOSWITCHMF, NewOOSwitchMF),
};

// DTAUCTION is the one optional element of the kinds: OOBUYDEBT requires its first two rows.
const OETagRow kBuyDebtRequired[] = {{OETAG_OO, OEVM_ALL, 0}, {OETAG_AUCTION, OEVM_ALL, 0}};

const OEAggregateDesc kListDesc = OE_DESC_NO_REQUIRED(OETAG_INVOOLIST, kListValid, kListFields);

} // namespace

OE_AGGREGATE_DEFINE_TABLES(OEOO, OEAggregate, OETAG_OO, kOOValid, kOORequired, kOOFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOBuyDebt, OEOpenOrder, OETAG_OOBUYDEBT, kBuyDebtValid, kBuyDebtRequired,
                           kBuyDebtFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOBuyMF, OEOpenOrder, OETAG_OOBUYMF, kBuyMFValid, kBuyMFValid, kBuyMFFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOBuyOpt, OEOpenOrder, OETAG_OOBUYOPT, kBuyOptValid, kBuyOptValid, kBuyOptFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOBuyOther, OEOpenOrder, OETAG_OOBUYOTHER, kOtherValid, kOtherValid,
                           kOtherFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOBuyStock, OEOpenOrder, OETAG_OOBUYSTOCK, kBuyStockValid, kBuyStockValid,
                           kBuyStockFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOSellDebt, OEOpenOrder, OETAG_OOSELLDEBT, kOOOnly, kOOOnly, kOOOnlyFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOSellMF, OEOpenOrder, OETAG_OOSELLMF, kSellMFValid, kSellMFValid, kSellMFFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOSellOpt, OEOpenOrder, OETAG_OOSELLOPT, kSellOptValid, kSellOptValid,
                           kSellOptFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOSellOther, OEOpenOrder, OETAG_OOSELLOTHER, kOtherValid, kOtherValid,
                           kOtherFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOSellStock, OEOpenOrder, OETAG_OOSELLSTOCK, kSellStockValid, kSellStockValid,
                           kSellStockFields)
OE_AGGREGATE_DEFINE_TABLES(OEOOSwitchMF, OEOpenOrder, OETAG_OOSWITCHMF, kSwitchValid, kSwitchValid,
                           kSwitchFields)
OE_AGGREGATE_DEFINE(OEInvOOList, OEMixedList, kListDesc, OETAG_INVOOLIST)
