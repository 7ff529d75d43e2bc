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
    const OEString* GetUniqueId() const { return GetText(OETAG_UNIQUEID); }
    unsigned short SetUniqueId(const OEString& v) { return SetFromText(OETAG_UNIQUEID, v); }
    const OEString* GetUniqueIdType() const { return GetText(OETAG_UNIQUEIDTYPE); }
    unsigned short SetUniqueIdType(const OEString& v) { return SetFromText(OETAG_UNIQUEIDTYPE, v); }

    OEString32 m_uniqueId;
    OEBoundedString<10> m_uniqueIdType;
};

// SECINFO: what every kind of security has. MEMO belongs to version 1, MEMO2 to the others.
class OE_API OESecInfo : public OEAggregate {
public:
    explicit OESecInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OESecID* GetSecID() const { return static_cast<OESecID*>(GetChildObj(OETAG_SECID)); }
    unsigned short SetSecID(OESecID* id) { return SetChildObj(OETAG_SECID, id); }
    const OEString* GetSecName() const { return GetText(OETAG_SECNAME); }
    unsigned short SetSecName(const OEString& v) { return SetFromText(OETAG_SECNAME, v); }
    const OEString* GetTicker() const { return GetText(OETAG_TICKER); }
    unsigned short SetTicker(const OEString& v) { return SetFromText(OETAG_TICKER, v); }
    const OEString* GetFIId() const { return GetText(OETAG_FIID); }
    unsigned short SetFIId(const OEString& v) { return SetFromText(OETAG_FIID, v); }
    const OEString* GetRating() const { return GetText(OETAG_RATING); }
    unsigned short SetRating(const OEString& v) { return SetFromText(OETAG_RATING, v); }
    const OEPrecisionInteger* GetUnitPrice() const { return GetAmount(OETAG_UNITPRICE); }
    unsigned short SetUnitPrice(const OEString& v) { return SetFromText(OETAG_UNITPRICE, v); }
    unsigned short SetUnitPrice(const OEPrecisionInteger& v) { return SetAmount(OETAG_UNITPRICE, v); }
    const OEDateTime* GetDateAsOf() const { return GetDateTime(OETAG_DTASOF); }
    unsigned short SetDateAsOf(const OEString& v) { return SetFromText(OETAG_DTASOF, v); }
    unsigned short SetDateAsOf(const OEDateTime& v) { return SetDateTime(OETAG_DTASOF, v); }
    OECurrency* GetCurrency() const { return static_cast<OECurrency*>(GetChildObj(OETAG_CURRENCY)); }
    unsigned short SetCurrency(OECurrency* c) { return SetChildObj(OETAG_CURRENCY, c); }
    const OEString* GetMemo() const { return GetText(OETAG_MEMO); }
    unsigned short SetMemo(const OEString& v) { return SetFromText(OETAG_MEMO, v); }
    const OEString* GetMemo2() const { return GetText(OETAG_MEMO2); }
    unsigned short SetMemo2(const OEString& v) { return SetFromText(OETAG_MEMO2, v); }

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
    OESecInfo* GetSecInfo() const { return static_cast<OESecInfo*>(GetChildObj(OETAG_SECINFO)); }
    unsigned short SetSecInfo(OESecInfo* info) { return SetChildObj(OETAG_SECINFO, info); }
    OEAssetClass GetAssetClass() const { return static_cast<OEAssetClass>(GetNumber(OETAG_ASSETCLASS)); }
    unsigned short SetAssetClass(const OEString& v) { return SetFromText(OETAG_ASSETCLASS, v); }
    unsigned short SetAssetClass(OEAssetClass v) {
        return SetNumber(OETAG_ASSETCLASS, static_cast<unsigned long>(v));
    }
    const OEString* GetFIAssetClass() const { return GetText(OETAG_FIASSETCLASS); }
    unsigned short SetFIAssetClass(const OEString& v) { return SetFromText(OETAG_FIASSETCLASS, v); }
    const OEPrecisionInteger* GetYield() const { return GetAmount(OETAG_YIELD); }
    unsigned short SetYield(const OEString& v) { return SetFromText(OETAG_YIELD, v); }
    unsigned short SetYield(const OEPrecisionInteger& v) { return SetAmount(OETAG_YIELD, v); }
    const OEDateTime* GetDateYieldAsOf() const { return GetDateTime(OETAG_DTYIELDASOF); }
    unsigned short SetDateYieldAsOf(const OEString& v) { return SetFromText(OETAG_DTYIELDASOF, v); }
    unsigned short SetDateYieldAsOf(const OEDateTime& v) { return SetDateTime(OETAG_DTYIELDASOF, v); }

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
    const OEPrecisionInteger* GetParValue() const { return GetAmount(OETAG_PARVALUE); }
    unsigned short SetParValue(const OEString& v) { return SetFromText(OETAG_PARVALUE, v); }
    unsigned short SetParValue(const OEPrecisionInteger& v) { return SetAmount(OETAG_PARVALUE, v); }
    OEDebtType GetDebtType() const { return static_cast<OEDebtType>(GetNumber(OETAG_DEBTTYPE)); }
    unsigned short SetDebtType(const OEString& v) { return SetFromText(OETAG_DEBTTYPE, v); }
    unsigned short SetDebtType(OEDebtType v) {
        return SetNumber(OETAG_DEBTTYPE, static_cast<unsigned long>(v));
    }
    OEDebtClass GetDebtClass() const { return static_cast<OEDebtClass>(GetNumber(OETAG_DEBTCLASS)); }
    unsigned short SetDebtClass(const OEString& v) { return SetFromText(OETAG_DEBTCLASS, v); }
    unsigned short SetDebtClass(OEDebtClass v) {
        return SetNumber(OETAG_DEBTCLASS, static_cast<unsigned long>(v));
    }
    const OEPrecisionInteger* GetCouponRate() const { return GetAmount(OETAG_COUPONRT); }
    unsigned short SetCouponRate(const OEString& v) { return SetFromText(OETAG_COUPONRT, v); }
    unsigned short SetCouponRate(const OEPrecisionInteger& v) { return SetAmount(OETAG_COUPONRT, v); }
    const OEDateTime* GetDateCoupon() const { return GetDateTime(OETAG_DTCOUPON); }
    unsigned short SetDateCoupon(const OEString& v) { return SetFromText(OETAG_DTCOUPON, v); }
    unsigned short SetDateCoupon(const OEDateTime& v) { return SetDateTime(OETAG_DTCOUPON, v); }
    OECouponFreq GetCouponFreq() const;
    unsigned short SetCouponFreq(const OEString& v) { return SetFromText(OETAG_COUPONFREQ, v); }
    unsigned short SetCouponFreq(OECouponFreq v) {
        return SetNumber(OETAG_COUPONFREQ, static_cast<unsigned long>(v));
    }
    const OEPrecisionInteger* GetCallPrice() const { return GetAmount(OETAG_CALLPRICE); }
    unsigned short SetCallPrice(const OEString& v) { return SetFromText(OETAG_CALLPRICE, v); }
    unsigned short SetCallPrice(const OEPrecisionInteger& v) { return SetAmount(OETAG_CALLPRICE, v); }
    const OEPrecisionInteger* GetYieldToCall() const { return GetAmount(OETAG_YIELDTOCALL); }
    unsigned short SetYieldToCall(const OEString& v) { return SetFromText(OETAG_YIELDTOCALL, v); }
    unsigned short SetYieldToCall(const OEPrecisionInteger& v) { return SetAmount(OETAG_YIELDTOCALL, v); }
    const OEDateTime* GetDateCall() const { return GetDateTime(OETAG_DTCALL); }
    unsigned short SetDateCall(const OEString& v) { return SetFromText(OETAG_DTCALL, v); }
    unsigned short SetDateCall(const OEDateTime& v) { return SetDateTime(OETAG_DTCALL, v); }
    OECallType GetCallType() const { return static_cast<OECallType>(GetNumber(OETAG_CALLTYPE)); }
    unsigned short SetCallType(const OEString& v) { return SetFromText(OETAG_CALLTYPE, v); }
    unsigned short SetCallType(OECallType v) {
        return SetNumber(OETAG_CALLTYPE, static_cast<unsigned long>(v));
    }
    const OEPrecisionInteger* GetYieldToMaturity() const { return GetAmount(OETAG_YIELDTOMAT); }
    unsigned short SetYieldToMaturity(const OEString& v) { return SetFromText(OETAG_YIELDTOMAT, v); }
    unsigned short SetYieldToMaturity(const OEPrecisionInteger& v) { return SetAmount(OETAG_YIELDTOMAT, v); }
    const OEDateTime* GetDateMaturity() const { return GetDateTime(OETAG_DTMAT); }
    unsigned short SetDateMaturity(const OEString& v) { return SetFromText(OETAG_DTMAT, v); }
    unsigned short SetDateMaturity(const OEDateTime& v) { return SetDateTime(OETAG_DTMAT, v); }

    OEPrecisionInteger m_parValue, m_couponRate, m_callPrice, m_yieldToCall, m_yieldToMat;
    unsigned short m_debtType = 0, m_debtClass = 0, m_couponFreq = 0, m_callType = 0;
    OEDateTime m_dtCoupon, m_dtCall, m_dtMat;
};

// PORTION: one asset class and its percentage of a fund.
class OE_API OEPortion : public OEAggregate {
public:
    explicit OEPortion(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEAssetClass GetAssetClass() const { return static_cast<OEAssetClass>(GetNumber(OETAG_ASSETCLASS)); }
    unsigned short SetAssetClass(const OEString& v) { return SetFromText(OETAG_ASSETCLASS, v); }
    unsigned short SetAssetClass(OEAssetClass v) {
        return SetNumber(OETAG_ASSETCLASS, static_cast<unsigned long>(v));
    }
    const OEPrecisionInteger* GetPercent() const { return GetAmount(OETAG_PERCENT); }
    unsigned short SetPercent(const OEString& v) { return SetFromText(OETAG_PERCENT, v); }
    unsigned short SetPercent(const OEPrecisionInteger& v) { return SetAmount(OETAG_PERCENT, v); }

    unsigned short m_assetClass = 0;
    OEPrecisionInteger m_percent;
};

// FIPORTION: the same with the institution's own asset class name.
class OE_API OEFIPortion : public OEAggregate {
public:
    explicit OEFIPortion(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEString* GetFIAssetClass() const { return GetText(OETAG_FIASSETCLASS); }
    unsigned short SetFIAssetClass(const OEString& v) { return SetFromText(OETAG_FIASSETCLASS, v); }
    const OEPrecisionInteger* GetPercent() const { return GetAmount(OETAG_PERCENT); }
    unsigned short SetPercent(const OEString& v) { return SetFromText(OETAG_PERCENT, v); }
    unsigned short SetPercent(const OEPrecisionInteger& v) { return SetAmount(OETAG_PERCENT, v); }

    OEString32 m_fiAssetClass;
    OEPrecisionInteger m_percent;
};

// MFASSETCLASS: the PORTION entries of a fund, in order.
class OE_API OEMFAssetClass : public OEAggregate {
public:
    explicit OEMFAssetClass(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AppendPortion(OEPortion* p) { return AppendToList(OETAG_PORTION, p); }
    OEPortion* GetPortion(unsigned short index) const {
        return static_cast<OEPortion*>(m_portions.Get(index));
    }
    unsigned short GetNumPortion() const { return m_portions.Entries(); }

    OEDataObjList m_portions;
};

// FIMFASSETCLASS: the FIPORTION entries of a fund, in order.
class OE_API OEFIMFAssetClass : public OEAggregate {
public:
    explicit OEFIMFAssetClass(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AppendFIPortion(OEFIPortion* p) { return AppendToList(OETAG_FIPORTION, p); }
    OEFIPortion* GetFIPortion(unsigned short index) const {
        return static_cast<OEFIPortion*>(m_portions.Get(index));
    }
    unsigned short GetNumFIPortion() const { return m_portions.Entries(); }

    OEDataObjList m_portions;
};

// MFINFO: a mutual fund.
class OE_API OEMFInfo : public OESecurityInfo {
public:
    explicit OEMFInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEMFType GetMFType() const { return static_cast<OEMFType>(GetNumber(OETAG_MFTYPE)); }
    unsigned short SetMFType(const OEString& v) { return SetFromText(OETAG_MFTYPE, v); }
    unsigned short SetMFType(OEMFType v) { return SetNumber(OETAG_MFTYPE, static_cast<unsigned long>(v)); }
    OEMFAssetClass* GetMFAssetClass() const {
        return static_cast<OEMFAssetClass*>(GetChildObj(OETAG_MFASSETCLASS));
    }
    unsigned short SetMFAssetClass(OEMFAssetClass* c) { return SetChildObj(OETAG_MFASSETCLASS, c); }
    OEFIMFAssetClass* GetFIMFAssetClass() const {
        return static_cast<OEFIMFAssetClass*>(GetChildObj(OETAG_FIMFASSETCLASS));
    }
    unsigned short SetFIMFAssetClass(OEFIMFAssetClass* c) { return SetChildObj(OETAG_FIMFASSETCLASS, c); }

    unsigned short m_mfType = 0;
    OEOwnedChild m_mfAssetClass, m_fiMfAssetClass;
};

// OPTINFO: an option; its own SECID names the underlying security.
class OE_API OEOptInfo : public OESecurityInfo {
public:
    explicit OEOptInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // OPTTYPE is "CALL" or "PUT" only (OEOT_OTHER is refused).
    OEOptType GetOptType() const { return static_cast<OEOptType>(GetNumber(OETAG_OPTTYPE)); }
    unsigned short SetOptType(const OEString& v) { return SetFromText(OETAG_OPTTYPE, v); }
    unsigned short SetOptType(OEOptType v) { return SetNumber(OETAG_OPTTYPE, static_cast<unsigned long>(v)); }
    const OEPrecisionInteger* GetStrikePrice() const { return GetAmount(OETAG_STRIKEPRICE); }
    unsigned short SetStrikePrice(const OEString& v) { return SetFromText(OETAG_STRIKEPRICE, v); }
    unsigned short SetStrikePrice(const OEPrecisionInteger& v) { return SetAmount(OETAG_STRIKEPRICE, v); }
    const OEDateTime* GetDateExpire() const { return GetDateTime(OETAG_DTEXPIRE); }
    unsigned short SetDateExpire(const OEString& v) { return SetFromText(OETAG_DTEXPIRE, v); }
    unsigned short SetDateExpire(const OEDateTime& v) { return SetDateTime(OETAG_DTEXPIRE, v); }
    // Shares per contract (up to five digits, so more than an unsigned short holds).
    unsigned long GetSharesPerContract() const { return GetNumber(OETAG_SHPERCTRCT); }
    unsigned short SetSharesPerContract(const OEString& v) { return SetFromText(OETAG_SHPERCTRCT, v); }
    unsigned short SetSharesPerContract(unsigned long v) { return SetNumber(OETAG_SHPERCTRCT, v); }
    OESecID* GetUnderlyingSecID() const { return static_cast<OESecID*>(GetChildObj(OETAG_SECID)); }
    unsigned short SetUnderlyingSecID(OESecID* id) { return SetChildObj(OETAG_SECID, id); }

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
    const OEString* GetTypeDesc() const { return GetText(OETAG_TYPEDESC); }
    unsigned short SetTypeDesc(const OEString& v) { return SetFromText(OETAG_TYPEDESC, v); }

    OEString32 m_typeDesc;
};

// STOCKINFO: a stock.
class OE_API OEStockInfo : public OESecurityInfo {
public:
    explicit OEStockInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEStockType GetStockType() const { return static_cast<OEStockType>(GetNumber(OETAG_STOCKTYPE)); }
    unsigned short SetStockType(const OEString& v) { return SetFromText(OETAG_STOCKTYPE, v); }
    unsigned short SetStockType(OEStockType v) {
        return SetNumber(OETAG_STOCKTYPE, static_cast<unsigned long>(v));
    }
    const OEString* GetTypeDesc() const { return GetText(OETAG_TYPEDESC); }
    unsigned short SetTypeDesc(const OEString& v) { return SetFromText(OETAG_TYPEDESC, v); }

    unsigned short m_stockType = 0;
    OEString32 m_typeDesc;
};

// SECLIST: any number of security descriptions of the five kinds, in document order.
class OE_API OESecList : public OEMixedList {
public:
    explicit OESecList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;

    // Appends a description of any of the five kinds (its own tag says which); the list owns it.
    // 0 for null or for an object of another kind (the caller keeps it).
    unsigned short AppendSecurity(OESecurityInfo* info) { return AppendEntry(info); }
    OESecurityInfo* GetSecurity(unsigned short index) const {
        return static_cast<OESecurityInfo*>(m_entries.Get(index));
    }
    unsigned short GetNumSecurity() const { return m_entries.Entries(); }
    // Deletes every entry and clears the five marks.
    void DeleteAllSecurity() { DeleteAllEntries(); }
};

// SECRQ: one security asked for, by exactly one of SECID, TICKER and FIID.
class OE_API OESecRq : public OEAggregate {
public:
    explicit OESecRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AllRequiredPresent() override { return OneValidPresent(); }
    OESecID* GetSecID() const { return static_cast<OESecID*>(GetChildObj(OETAG_SECID)); }
    unsigned short SetSecID(OESecID* id) { return SetChildObj(OETAG_SECID, id); }
    const OEString* GetTicker() const { return GetText(OETAG_TICKER); }
    unsigned short SetTicker(const OEString& v) { return SetFromText(OETAG_TICKER, v); }
    const OEString* GetFIId() const { return GetText(OETAG_FIID); }
    unsigned short SetFIId(const OEString& v) { return SetFromText(OETAG_FIID, v); }

    OEOwnedChild m_secId;
    OEString32 m_ticker, m_fiId;
};

// SECLISTRQ: the securities asked for (none asks for no description, only the wrapper's status).
class OE_API OESecListRq : public OETransBase {
public:
    explicit OESecListRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AppendSecRq(OESecRq* rq) { return AppendToList(OETAG_SECRQ, rq); }
    OESecRq* GetSecRq(unsigned short index) const { return static_cast<OESecRq*>(m_secRq.Get(index)); }
    unsigned short GetNumSecRq() const { return m_secRq.Entries(); }

    OEDataObjList m_secRq;
};

// SECLISTRS: an empty acknowledgement; the securities come in the message set's SECLIST.
class OE_API OESecListRs : public OETransBase {
public:
    explicit OESecListRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

#endif
