#include "messages/oeseclist.h"

namespace {

// Two elements take their own keyword lists (the rest use the conversions' tables). The last two
// words of COUPONFREQ are other spellings of SEMIANNUAL and ANNUAL, kept so that a value is written
// back as it was read; GetCouponFreq folds them.
const char* const kCouponFreq[] = {"MONTHLY", "QUARTERLY",    "SEMIANNUAL", "ANNUAL",
                                   "OTHER",   "SEMIANNUALLY", "ANUALLY"};
const char* const kOptType[] = {"PUT", "CALL"}; // OEOT_OTHER has no keyword in OPTINFO
const OEKeywordTable kCouponFreqTable = {kCouponFreq, 7};
const OEKeywordTable kOptTypeTable = {kOptType, 2};

// SECLISTRS has no rows at all.
const OETagRow kNoRows[] = {{OETAG_NONE, 0, 0}};

// Rows every security description shares.
#define OE_SECINFO_ROW(C)                                                                                    \
    { OETAG_SECINFO, OEFK_CHILD, OE_MEMBER(C, m_secInfo), nullptr, OE_MAKE(NewSecInfo) }
#define OE_ASSETCLASS_ROWS(C)                                                                                \
    {OETAG_ASSETCLASS, OEFK_ENUM, OE_MEMBER(C, m_assetClass), &OEKW_ASSETCLASS, nullptr}, {                  \
        OETAG_FIASSETCLASS, OEFK_TEXT, OE_MEMBER(C, m_fiAssetClass), nullptr, nullptr                        \
    }

#define OE_YIELD_ROWS(C)                                                                                     \
    {OETAG_YIELD, OEFK_AMOUNT, OE_MEMBER(C, m_yield), nullptr, nullptr}, {                                   \
        OETAG_DTYIELDASOF, OEFK_DATETIME, OE_MEMBER(C, m_dtYieldAsOf), nullptr, nullptr                      \
    }

// ---- SECID ----
const OETagRow kSecIdValid[] = {{OETAG_UNIQUEID, OEVM_ALL, 0}, {OETAG_UNIQUEIDTYPE, OEVM_ALL, 0}};
const OEFieldRow kSecIdFields[] = {
    {OETAG_UNIQUEID, OEFK_TEXT, OE_MEMBER(OESecID, m_uniqueId), nullptr, nullptr},
    {OETAG_UNIQUEIDTYPE, OEFK_TEXT, OE_MEMBER(OESecID, m_uniqueIdType), nullptr, nullptr},
};

// ---- SECINFO ----
const OETagRow kSecInfoValid[] = {{OETAG_SECID, OEVM_ALL, 0},  {OETAG_SECNAME, OEVM_ALL, 0},
                                  {OETAG_TICKER, OEVM_ALL, 0}, {OETAG_FIID, OEVM_ALL, 0},
                                  {OETAG_RATING, OEVM_ALL, 0}, {OETAG_UNITPRICE, OEVM_ALL, 0},
                                  {OETAG_DTASOF, OEVM_ALL, 0}, {OETAG_CURRENCY, OEVM_ALL, 0},
                                  {OETAG_MEMO, OEVM_V1, 0},    {OETAG_MEMO2, OEVM_NOTV1, 0}};
const OETagRow kSecInfoRequired[] = {{OETAG_SECID, OEVM_ALL, 0}, {OETAG_SECNAME, OEVM_ALL, 0}};
const OEFieldRow kSecInfoFields[] = {
    {OETAG_SECID, OEFK_CHILD, OE_MEMBER(OESecInfo, m_secId), nullptr, OE_MAKE(NewSecID)},
    {OETAG_SECNAME, OEFK_TEXT, OE_MEMBER(OESecInfo, m_secName), nullptr, nullptr},
    {OETAG_TICKER, OEFK_TEXT, OE_MEMBER(OESecInfo, m_ticker), nullptr, nullptr},
    {OETAG_FIID, OEFK_TEXT, OE_MEMBER(OESecInfo, m_fiId), nullptr, nullptr},
    {OETAG_RATING, OEFK_TEXT, OE_MEMBER(OESecInfo, m_rating), nullptr, nullptr},
    {OETAG_UNITPRICE, OEFK_AMOUNT, OE_MEMBER(OESecInfo, m_unitPrice), nullptr, nullptr},
    {OETAG_DTASOF, OEFK_DATETIME, OE_MEMBER(OESecInfo, m_dtAsOf), nullptr, nullptr},
    {OETAG_CURRENCY, OEFK_CHILD, OE_MEMBER(OESecInfo, m_currency), nullptr, OE_MAKE(NewCurrency)},
    {OETAG_MEMO, OEFK_TEXT, OE_MEMBER(OESecInfo, m_memo), nullptr, nullptr},
    {OETAG_MEMO2, OEFK_TEXT, OE_MEMBER(OESecInfo, m_memo2), nullptr, nullptr},
};

// ---- DEBTINFO ----
const OETagRow kDebtValid[] = {
    {OETAG_SECINFO, OEVM_ALL, 0},    {OETAG_PARVALUE, OEVM_ALL, 0},   {OETAG_DEBTTYPE, OEVM_ALL, 0},
    {OETAG_DEBTCLASS, OEVM_ALL, 0},  {OETAG_COUPONRT, OEVM_ALL, 0},   {OETAG_DTCOUPON, OEVM_ALL, 0},
    {OETAG_COUPONFREQ, OEVM_ALL, 0}, {OETAG_CALLPRICE, OEVM_ALL, 0},  {OETAG_YIELDTOCALL, OEVM_ALL, 0},
    {OETAG_DTCALL, OEVM_ALL, 0},     {OETAG_CALLTYPE, OEVM_ALL, 0},   {OETAG_YIELDTOMAT, OEVM_ALL, 0},
    {OETAG_DTMAT, OEVM_ALL, 0},      {OETAG_ASSETCLASS, OEVM_ALL, 0}, {OETAG_FIASSETCLASS, OEVM_ALL, 0}};
const OETagRow kDebtRequired[] = {
    {OETAG_SECINFO, OEVM_ALL, 0}, {OETAG_PARVALUE, OEVM_ALL, 0}, {OETAG_DEBTTYPE, OEVM_ALL, 0}};
const OEFieldRow kDebtFields[] = {
    OE_SECINFO_ROW(OEDebtInfo),
    {OETAG_PARVALUE, OEFK_AMOUNT, OE_MEMBER(OEDebtInfo, m_parValue), nullptr, nullptr},
    {OETAG_DEBTTYPE, OEFK_ENUM, OE_MEMBER(OEDebtInfo, m_debtType), &OEKW_DEBTTYPE, nullptr},
    {OETAG_DEBTCLASS, OEFK_ENUM, OE_MEMBER(OEDebtInfo, m_debtClass), &OEKW_DEBTCLASS, nullptr},
    {OETAG_COUPONRT, OEFK_AMOUNT, OE_MEMBER(OEDebtInfo, m_couponRate), nullptr, nullptr},
    {OETAG_DTCOUPON, OEFK_DATETIME, OE_MEMBER(OEDebtInfo, m_dtCoupon), nullptr, nullptr},
    {OETAG_COUPONFREQ, OEFK_ENUM, OE_MEMBER(OEDebtInfo, m_couponFreq), &kCouponFreqTable, nullptr},
    {OETAG_CALLPRICE, OEFK_AMOUNT, OE_MEMBER(OEDebtInfo, m_callPrice), nullptr, nullptr},
    {OETAG_YIELDTOCALL, OEFK_AMOUNT, OE_MEMBER(OEDebtInfo, m_yieldToCall), nullptr, nullptr},
    {OETAG_DTCALL, OEFK_DATETIME, OE_MEMBER(OEDebtInfo, m_dtCall), nullptr, nullptr},
    {OETAG_CALLTYPE, OEFK_ENUM, OE_MEMBER(OEDebtInfo, m_callType), &OEKW_CALLTYPE, nullptr},
    {OETAG_YIELDTOMAT, OEFK_AMOUNT, OE_MEMBER(OEDebtInfo, m_yieldToMat), nullptr, nullptr},
    {OETAG_DTMAT, OEFK_DATETIME, OE_MEMBER(OEDebtInfo, m_dtMat), nullptr, nullptr},
    OE_ASSETCLASS_ROWS(OEDebtInfo),
};

// ---- PORTION, FIPORTION, MFASSETCLASS, FIMFASSETCLASS ----
const OETagRow kPortionValid[] = {{OETAG_ASSETCLASS, OEVM_ALL, 0}, {OETAG_PERCENT, OEVM_ALL, 0}};
const OEFieldRow kPortionFields[] = {
    {OETAG_ASSETCLASS, OEFK_ENUM, OE_MEMBER(OEPortion, m_assetClass), &OEKW_ASSETCLASS, nullptr},
    {OETAG_PERCENT, OEFK_AMOUNT, OE_MEMBER(OEPortion, m_percent), nullptr, nullptr},
};
const OETagRow kFIPortionValid[] = {{OETAG_FIASSETCLASS, OEVM_ALL, 0}, {OETAG_PERCENT, OEVM_ALL, 0}};
const OEFieldRow kFIPortionFields[] = {
    {OETAG_FIASSETCLASS, OEFK_TEXT, OE_MEMBER(OEFIPortion, m_fiAssetClass), nullptr, nullptr},
    {OETAG_PERCENT, OEFK_AMOUNT, OE_MEMBER(OEFIPortion, m_percent), nullptr, nullptr},
};
const OETagRow kMFAssetValid[] = {{OETAG_PORTION, OEVM_ALL, 0}};
const OEFieldRow kMFAssetFields[] = {
    {OETAG_PORTION, OEFK_LIST, OE_MEMBER(OEMFAssetClass, m_portions), nullptr, OE_MAKE(NewPortion)}};
const OETagRow kFIMFAssetValid[] = {{OETAG_FIPORTION, OEVM_ALL, 0}};
const OEFieldRow kFIMFAssetFields[] = {
    {OETAG_FIPORTION, OEFK_LIST, OE_MEMBER(OEFIMFAssetClass, m_portions), nullptr, OE_MAKE(NewFIPortion)}};

// ---- MFINFO ----
const OETagRow kMFValid[] = {{OETAG_SECINFO, OEVM_ALL, 0},      {OETAG_MFTYPE, OEVM_ALL, 0},
                             {OETAG_YIELD, OEVM_ALL, 0},        {OETAG_DTYIELDASOF, OEVM_ALL, 0},
                             {OETAG_MFASSETCLASS, OEVM_ALL, 0}, {OETAG_FIMFASSETCLASS, OEVM_ALL, 0}};
const OETagRow kSecInfoOnly[] = {{OETAG_SECINFO, OEVM_ALL, 0}};
const OEFieldRow kMFFields[] = {
    OE_SECINFO_ROW(OEMFInfo),
    {OETAG_MFTYPE, OEFK_ENUM, OE_MEMBER(OEMFInfo, m_mfType), &OEKW_MFTYPE, nullptr},
    OE_YIELD_ROWS(OEMFInfo),
    {OETAG_MFASSETCLASS, OEFK_CHILD, OE_MEMBER(OEMFInfo, m_mfAssetClass), nullptr, OE_MAKE(NewMFAssetClass)},
    {OETAG_FIMFASSETCLASS, OEFK_CHILD, OE_MEMBER(OEMFInfo, m_fiMfAssetClass), nullptr,
     OE_MAKE(NewFIMFAssetClass)},
};

// ---- OPTINFO ----
const OETagRow kOptValid[] = {{OETAG_SECINFO, OEVM_ALL, 0},     {OETAG_OPTTYPE, OEVM_ALL, 0},
                              {OETAG_STRIKEPRICE, OEVM_ALL, 0}, {OETAG_DTEXPIRE, OEVM_ALL, 0},
                              {OETAG_SHPERCTRCT, OEVM_ALL, 0},  {OETAG_SECID, OEVM_ALL, 0},
                              {OETAG_ASSETCLASS, OEVM_ALL, 0},  {OETAG_FIASSETCLASS, OEVM_ALL, 0}};
const OETagRow kOptRequired[] = {{OETAG_SECINFO, OEVM_ALL, 0},
                                 {OETAG_OPTTYPE, OEVM_ALL, 0},
                                 {OETAG_STRIKEPRICE, OEVM_ALL, 0},
                                 {OETAG_DTEXPIRE, OEVM_ALL, 0},
                                 {OETAG_SHPERCTRCT, OEVM_ALL, 0}};
const OEFieldRow kOptFields[] = {
    OE_SECINFO_ROW(OEOptInfo),
    {OETAG_OPTTYPE, OEFK_ENUM, OE_MEMBER(OEOptInfo, m_optType), &kOptTypeTable, nullptr},
    {OETAG_STRIKEPRICE, OEFK_AMOUNT, OE_MEMBER(OEOptInfo, m_strikePrice), nullptr, nullptr},
    {OETAG_DTEXPIRE, OEFK_DATETIME, OE_MEMBER(OEOptInfo, m_dtExpire), nullptr, nullptr},
    {OETAG_SHPERCTRCT, OEFK_ULONG, OE_MEMBER(OEOptInfo, m_shPerCtrct), nullptr, nullptr},
    {OETAG_SECID, OEFK_CHILD, OE_MEMBER(OEOptInfo, m_secId), nullptr, OE_MAKE(NewSecID)},
    OE_ASSETCLASS_ROWS(OEOptInfo),
};

// ---- OTHERINFO ----
const OETagRow kOtherValid[] = {{OETAG_SECINFO, OEVM_ALL, 0},
                                {OETAG_TYPEDESC, OEVM_ALL, 0},
                                {OETAG_ASSETCLASS, OEVM_ALL, 0},
                                {OETAG_FIASSETCLASS, OEVM_ALL, 0}};
const OEFieldRow kOtherFields[] = {
    OE_SECINFO_ROW(OEOtherInfo),
    {OETAG_TYPEDESC, OEFK_TEXT, OE_MEMBER(OEOtherInfo, m_typeDesc), nullptr, nullptr},
    OE_ASSETCLASS_ROWS(OEOtherInfo),
};

// ---- STOCKINFO ----
const OETagRow kStockValid[] = {{OETAG_SECINFO, OEVM_ALL, 0},     {OETAG_STOCKTYPE, OEVM_ALL, 0},
                                {OETAG_YIELD, OEVM_ALL, 0},       {OETAG_DTYIELDASOF, OEVM_ALL, 0},
                                {OETAG_TYPEDESC, OEVM_ALL, 0},    {OETAG_ASSETCLASS, OEVM_ALL, 0},
                                {OETAG_FIASSETCLASS, OEVM_ALL, 0}};
const OEFieldRow kStockFields[] = {
    OE_SECINFO_ROW(OEStockInfo),
    {OETAG_STOCKTYPE, OEFK_ENUM, OE_MEMBER(OEStockInfo, m_stockType), &OEKW_STOCKTYPE, nullptr},
    OE_YIELD_ROWS(OEStockInfo),
    {OETAG_TYPEDESC, OEFK_TEXT, OE_MEMBER(OEStockInfo, m_typeDesc), nullptr, nullptr},
    OE_ASSETCLASS_ROWS(OEStockInfo),
};

// ---- SECLIST ----
// The five rows share one list; each row names the factory operation of its kind.
const OETagRow kSecListValid[] = {{OETAG_DEBTINFO, OEVM_ALL, 0},
                                  {OETAG_MFINFO, OEVM_ALL, 0},
                                  {OETAG_OPTINFO, OEVM_ALL, 0},
                                  {OETAG_OTHERINFO, OEVM_ALL, 0},
                                  {OETAG_STOCKINFO, OEVM_ALL, 0}};
const OEFieldRow kSecListFields[] = {
    {OETAG_DEBTINFO, OEFK_LIST, OE_MEMBER(OESecList, m_entries), nullptr, OE_MAKE(NewDebtInfo)},
    {OETAG_MFINFO, OEFK_LIST, OE_MEMBER(OESecList, m_entries), nullptr, OE_MAKE(NewMFInfo)},
    {OETAG_OPTINFO, OEFK_LIST, OE_MEMBER(OESecList, m_entries), nullptr, OE_MAKE(NewOptInfo)},
    {OETAG_OTHERINFO, OEFK_LIST, OE_MEMBER(OESecList, m_entries), nullptr, OE_MAKE(NewOtherInfo)},
    {OETAG_STOCKINFO, OEFK_LIST, OE_MEMBER(OESecList, m_entries), nullptr, OE_MAKE(NewStockInfo)},
};

// ---- SECRQ, SECLISTRQ, SECLISTRS ----
const OETagRow kSecRqValid[] = {
    {OETAG_SECID, OEVM_ALL, 0}, {OETAG_TICKER, OEVM_ALL, 0}, {OETAG_FIID, OEVM_ALL, 0}};
const OEFieldRow kSecRqFields[] = {
    {OETAG_SECID, OEFK_CHILD, OE_MEMBER(OESecRq, m_secId), nullptr, OE_MAKE(NewSecID)},
    {OETAG_TICKER, OEFK_TEXT, OE_MEMBER(OESecRq, m_ticker), nullptr, nullptr},
    {OETAG_FIID, OEFK_TEXT, OE_MEMBER(OESecRq, m_fiId), nullptr, nullptr},
};
const OETagRow kSecListRqValid[] = {{OETAG_SECRQ, OEVM_ALL, 0}};
const OEFieldRow kSecListRqFields[] = {
    {OETAG_SECRQ, OEFK_LIST, OE_MEMBER(OESecListRq, m_secRq), nullptr, OE_MAKE(NewSecRq)}};
const OEFieldRow kNoFields[] = {{OETAG_NONE, OEFK_TEXT, nullptr, nullptr, nullptr}};

const OEAggregateDesc kSecIdDesc = OE_DESC(OETAG_SECID, kSecIdValid, kSecIdValid, kSecIdFields);
const OEAggregateDesc kSecInfoDesc = OE_DESC(OETAG_SECINFO, kSecInfoValid, kSecInfoRequired, kSecInfoFields);
const OEAggregateDesc kDebtDesc = OE_DESC(OETAG_DEBTINFO, kDebtValid, kDebtRequired, kDebtFields);
const OEAggregateDesc kPortionDesc = OE_DESC(OETAG_PORTION, kPortionValid, kPortionValid, kPortionFields);
const OEAggregateDesc kFIPortionDesc =
    OE_DESC(OETAG_FIPORTION, kFIPortionValid, kFIPortionValid, kFIPortionFields);
const OEAggregateDesc kMFAssetDesc = OE_DESC_NO_REQUIRED(OETAG_MFASSETCLASS, kMFAssetValid, kMFAssetFields);
const OEAggregateDesc kFIMFAssetDesc =
    OE_DESC_NO_REQUIRED(OETAG_FIMFASSETCLASS, kFIMFAssetValid, kFIMFAssetFields);
const OEAggregateDesc kMFDesc = OE_DESC(OETAG_MFINFO, kMFValid, kSecInfoOnly, kMFFields);
const OEAggregateDesc kOptDesc = OE_DESC(OETAG_OPTINFO, kOptValid, kOptRequired, kOptFields);
const OEAggregateDesc kOtherDesc = OE_DESC(OETAG_OTHERINFO, kOtherValid, kSecInfoOnly, kOtherFields);
const OEAggregateDesc kStockDesc = OE_DESC(OETAG_STOCKINFO, kStockValid, kSecInfoOnly, kStockFields);
const OEAggregateDesc kSecListDesc = OE_DESC_NO_REQUIRED(OETAG_SECLIST, kSecListValid, kSecListFields);
const OEAggregateDesc kSecRqDesc = OE_DESC_NO_REQUIRED(OETAG_SECRQ, kSecRqValid, kSecRqFields);
const OEAggregateDesc kSecListRqDesc =
    OE_DESC_NO_REQUIRED(OETAG_SECLISTRQ, kSecListRqValid, kSecListRqFields);
const OEAggregateDesc kSecListRsDesc = {OETAG_SECLISTRS, kNoRows, 0, kNoRows, 0, kNoFields, 0};

} // namespace

OE_AGGREGATE_DEFINE(OESecID, OEAggregate, kSecIdDesc, OETAG_SECID)
OE_AGGREGATE_DEFINE(OESecInfo, OEAggregate, kSecInfoDesc, OETAG_SECINFO)
OE_AGGREGATE_DEFINE(OEDebtInfo, OESecurityInfo, kDebtDesc, OETAG_DEBTINFO)
OE_AGGREGATE_DEFINE(OEPortion, OEAggregate, kPortionDesc, OETAG_PORTION)
OE_AGGREGATE_DEFINE(OEFIPortion, OEAggregate, kFIPortionDesc, OETAG_FIPORTION)
OE_AGGREGATE_DEFINE(OEMFAssetClass, OEAggregate, kMFAssetDesc, OETAG_MFASSETCLASS)
OE_AGGREGATE_DEFINE(OEFIMFAssetClass, OEAggregate, kFIMFAssetDesc, OETAG_FIMFASSETCLASS)
OE_AGGREGATE_DEFINE(OEMFInfo, OESecurityInfo, kMFDesc, OETAG_MFINFO)
OE_AGGREGATE_DEFINE(OEOptInfo, OESecurityInfo, kOptDesc, OETAG_OPTINFO)
OE_AGGREGATE_DEFINE(OEOtherInfo, OESecurityInfo, kOtherDesc, OETAG_OTHERINFO)
OE_AGGREGATE_DEFINE(OEStockInfo, OESecurityInfo, kStockDesc, OETAG_STOCKINFO)
OE_AGGREGATE_DEFINE(OESecList, OEMixedList, kSecListDesc, OETAG_SECLIST)
OE_AGGREGATE_DEFINE(OESecRq, OEAggregate, kSecRqDesc, OETAG_SECRQ)
OE_AGGREGATE_DEFINE(OESecListRq, OETransBase, kSecListRqDesc, OETAG_SECLISTRQ)
OE_AGGREGATE_DEFINE(OESecListRs, OETransBase, kSecListRsDesc, OETAG_SECLISTRS)

OECouponFreq OEDebtInfo::GetCouponFreq() const {
    unsigned long v = GetNumber(OETAG_COUPONFREQ);
    if (v == 5) return OECF_SEMIANNUAL; // "SEMIANNUALLY"
    if (v == 6) return OECF_ANNUAL;     // "ANUALLY"
    return static_cast<OECouponFreq>(v);
}
