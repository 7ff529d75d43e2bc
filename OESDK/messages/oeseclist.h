// The security list: SECID, SECINFO, the five kinds of security description (DEBTINFO, MFINFO,
// OPTINFO, OTHERINFO, STOCKINFO) with the mutual-fund asset mixes (MFASSETCLASS, PORTION,
// FIMFASSETCLASS, FIPORTION), the SECLIST that a response message set carries after its
// transaction wrappers, and the inner messages SECLISTRQ (with its SECRQ entries) and SECLISTRS.
//
// Enumerated elements answer their value as the enumeration of foundation/oeenums.h; an absent
// element answers 0, so test presence with ValidateTag(tag) where 0 is a meaningful value.
#ifndef OESDK_MESSAGES_OESECLIST_H
#define OESDK_MESSAGES_OESECLIST_H
#include "foundation/oeenums.h"
#include "messages/oecurrency.h"
#include "messages/oetrans.h"

// SECID: UNIQUEID and UNIQUEIDTYPE (a CUSIP, an ISIN, ...), both required.
class OE_API OESecID : public OEAggregate {
public:
    explicit OESecID(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(UniqueId, OETAG_UNIQUEID);
    OE_TEXT_ACCESSORS(UniqueIdType, OETAG_UNIQUEIDTYPE);

    OEString32 m_uniqueId;
    OEBoundedString<10> m_uniqueIdType;
};

// SECINFO: what every kind of security has. MEMO belongs to version 1, MEMO2 to the others.
class OE_API OESecInfo : public OEAggregate {
public:
    explicit OESecInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_CHILD_ACCESSORS(SecID, OESecID, OETAG_SECID);
    OE_TEXT_ACCESSORS(SecName, OETAG_SECNAME);
    OE_TEXT_ACCESSORS(Ticker, OETAG_TICKER);
    OE_TEXT_ACCESSORS(FIId, OETAG_FIID);
    OE_TEXT_ACCESSORS(Rating, OETAG_RATING);
    OE_AMOUNT_ACCESSORS(UnitPrice, OETAG_UNITPRICE);
    OE_DATE_ACCESSORS(DateAsOf, OETAG_DTASOF);
    OE_CHILD_ACCESSORS(Currency, OECurrency, OETAG_CURRENCY);
    OE_TEXT_ACCESSORS(Memo, OETAG_MEMO);
    OE_TEXT_ACCESSORS(Memo2, OETAG_MEMO2);

    OEOwnedChild m_secId;
    OEBoundedString<120> m_secName;
    OEString32 m_ticker, m_fiId;
    OEBoundedString<10> m_rating;
    OEPrecisionInteger m_unitPrice;
    OEDateTime m_dtAsOf;
    OEOwnedChild m_currency;
    OEString255 m_memo;
    OEBoundedString<390> m_memo2;
};

// The common part of the five security descriptions: the SECINFO they all start with and the
// elements several of them share. A kind without one of those elements refuses to set it (0) and
// answers 0 or null: MFINFO has no ASSETCLASS or FIASSETCLASS of its own (its mix is in
// MFASSETCLASS / FIMFASSETCLASS); only MFINFO and STOCKINFO have YIELD and DTYIELDASOF.
class OE_API OESecurityInfo : public OEAggregate {
public:
    explicit OESecurityInfo(unsigned short version = 0) : OEAggregate(version) {}
    OE_CHILD_ACCESSORS(SecInfo, OESecInfo, OETAG_SECINFO);
    OE_NUMBER_ACCESSORS(AssetClass, OEAssetClass, OETAG_ASSETCLASS);
    OE_TEXT_ACCESSORS(FIAssetClass, OETAG_FIASSETCLASS);
    OE_AMOUNT_ACCESSORS(Yield, OETAG_YIELD);
    OE_DATE_ACCESSORS(DateYieldAsOf, OETAG_DTYIELDASOF);

    OEOwnedChild m_secInfo;
    unsigned short m_assetClass = 0;
    OEString32 m_fiAssetClass;
    OEPrecisionInteger m_yield;
    OEDateTime m_dtYieldAsOf;
};

// DEBTINFO: a bond. COUPONFREQ also accepts the spellings "SEMIANNUALLY" and "ANUALLY" that some
// document type definitions use; such a value is written back as it was read and answers
// OECF_SEMIANNUAL / OECF_ANNUAL.
class OE_API OEDebtInfo : public OESecurityInfo {
public:
    explicit OEDebtInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_AMOUNT_ACCESSORS(ParValue, OETAG_PARVALUE);
    OE_NUMBER_ACCESSORS(DebtType, OEDebtType, OETAG_DEBTTYPE);
    OE_NUMBER_ACCESSORS(DebtClass, OEDebtClass, OETAG_DEBTCLASS);
    OE_AMOUNT_ACCESSORS(CouponRate, OETAG_COUPONRT);
    OE_DATE_ACCESSORS(DateCoupon, OETAG_DTCOUPON);
    OECouponFreq GetCouponFreq() const;
    OE_SET_FROM_TEXT(CouponFreq, OETAG_COUPONFREQ);
    OE_SET_NUMBER(CouponFreq, OECouponFreq, OETAG_COUPONFREQ);
    OE_AMOUNT_ACCESSORS(CallPrice, OETAG_CALLPRICE);
    OE_AMOUNT_ACCESSORS(YieldToCall, OETAG_YIELDTOCALL);
    OE_DATE_ACCESSORS(DateCall, OETAG_DTCALL);
    OE_NUMBER_ACCESSORS(CallType, OECallType, OETAG_CALLTYPE);
    OE_AMOUNT_ACCESSORS(YieldToMaturity, OETAG_YIELDTOMAT);
    OE_DATE_ACCESSORS(DateMaturity, OETAG_DTMAT);

    OEPrecisionInteger m_parValue, m_couponRate, m_callPrice, m_yieldToCall, m_yieldToMat;
    unsigned short m_debtType = 0, m_debtClass = 0, m_couponFreq = 0, m_callType = 0;
    OEDateTime m_dtCoupon, m_dtCall, m_dtMat;
};

// PORTION: one asset class and its percentage of a fund.
class OE_API OEPortion : public OEAggregate {
public:
    explicit OEPortion(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_ACCESSORS(AssetClass, OEAssetClass, OETAG_ASSETCLASS);
    OE_AMOUNT_ACCESSORS(Percent, OETAG_PERCENT);

    unsigned short m_assetClass = 0;
    OEPrecisionInteger m_percent;
};

// FIPORTION: the same with the institution's own asset class name.
class OE_API OEFIPortion : public OEAggregate {
public:
    explicit OEFIPortion(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(FIAssetClass, OETAG_FIASSETCLASS);
    OE_AMOUNT_ACCESSORS(Percent, OETAG_PERCENT);

    OEString32 m_fiAssetClass;
    OEPrecisionInteger m_percent;
};

// MFASSETCLASS: the PORTION entries of a fund, in order.
class OE_API OEMFAssetClass : public OEAggregate {
public:
    explicit OEMFAssetClass(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ACCESSORS(Portion, OEPortion, OETAG_PORTION, m_portions);

    OEDataObjList m_portions;
};

// FIMFASSETCLASS: the FIPORTION entries of a fund, in order.
class OE_API OEFIMFAssetClass : public OEAggregate {
public:
    explicit OEFIMFAssetClass(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ACCESSORS(FIPortion, OEFIPortion, OETAG_FIPORTION, m_portions);

    OEDataObjList m_portions;
};

// MFINFO: a mutual fund.
class OE_API OEMFInfo : public OESecurityInfo {
public:
    explicit OEMFInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_ACCESSORS(MFType, OEMFType, OETAG_MFTYPE);
    OE_CHILD_ACCESSORS(MFAssetClass, OEMFAssetClass, OETAG_MFASSETCLASS);
    OE_CHILD_ACCESSORS(FIMFAssetClass, OEFIMFAssetClass, OETAG_FIMFASSETCLASS);

    unsigned short m_mfType = 0;
    OEOwnedChild m_mfAssetClass, m_fiMfAssetClass;
};

// OPTINFO: an option; its own SECID names the underlying security.
class OE_API OEOptInfo : public OESecurityInfo {
public:
    explicit OEOptInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // OPTTYPE is "CALL" or "PUT" only (OEOT_OTHER is refused).
    OE_NUMBER_ACCESSORS(OptType, OEOptType, OETAG_OPTTYPE);
    OE_AMOUNT_ACCESSORS(StrikePrice, OETAG_STRIKEPRICE);
    OE_DATE_ACCESSORS(DateExpire, OETAG_DTEXPIRE);
    // Shares per contract (up to five digits, so more than an unsigned short holds).
    OE_NUMBER_ACCESSORS(SharesPerContract, unsigned long, OETAG_SHPERCTRCT);
    OE_CHILD_ACCESSORS(UnderlyingSecID, OESecID, OETAG_SECID);

    unsigned short m_optType = 0;
    OEPrecisionInteger m_strikePrice;
    OEDateTime m_dtExpire;
    unsigned long m_shPerCtrct = 0;
    OEOwnedChild m_secId;
};

// OTHERINFO: any other kind of security, described in words.
class OE_API OEOtherInfo : public OESecurityInfo {
public:
    explicit OEOtherInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(TypeDesc, OETAG_TYPEDESC);

    OEString32 m_typeDesc;
};

// STOCKINFO: a stock.
class OE_API OEStockInfo : public OESecurityInfo {
public:
    explicit OEStockInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_ACCESSORS(StockType, OEStockType, OETAG_STOCKTYPE);
    OE_TEXT_ACCESSORS(TypeDesc, OETAG_TYPEDESC);

    unsigned short m_stockType = 0;
    OEString32 m_typeDesc;
};

// SECLIST: any number of security descriptions of the five kinds, in document order.
class OE_API OESecList : public OEMixedList {
public:
    explicit OESecList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;

    // AppendSecurity takes a description of any of the five kinds (its own tag says which); the
    // list owns it. 0 for null or for an object of another kind (the caller keeps it).
    // DeleteAllSecurity deletes every entry and clears the five marks.
    OE_ENTRY_ACCESSORS(Security, OESecurityInfo);
};

// SECRQ: one security asked for, by exactly one of SECID, TICKER and FIID.
class OE_API OESecRq : public OEAggregate {
public:
    explicit OESecRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AllRequiredPresent() override { return OneValidPresent(); }
    OE_CHILD_ACCESSORS(SecID, OESecID, OETAG_SECID);
    OE_TEXT_ACCESSORS(Ticker, OETAG_TICKER);
    OE_TEXT_ACCESSORS(FIId, OETAG_FIID);

    OEOwnedChild m_secId;
    OEString32 m_ticker, m_fiId;
};

// SECLISTRQ: the securities asked for (none asks for no description, only the wrapper's status).
class OE_API OESecListRq : public OETransBase {
public:
    explicit OESecListRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ACCESSORS(SecRq, OESecRq, OETAG_SECRQ, m_secRq);

    OEDataObjList m_secRq;
};

// SECLISTRS: an empty acknowledgement; the securities come in the message set's SECLIST.
OE_AGGREGATE_CLASS(OESecListRs, OETransBase);

#endif
