// Open orders of an investment statement: OO (what every order has), the eleven kinds of order
// that wrap it (OOBUYDEBT ... OOSELLSTOCK, OOSWITCHMF) and INVOOLIST, which keeps them in the order
// they were read or appended.
//
// Enumerated elements answer their value as the enumeration of foundation/oeenums.h; an absent
// element answers 0, so test presence with ValidateTag(tag) where 0 is a meaningful value.
// INV401KSOURCE has no row in the tag dictionary, so an order cannot carry it; the parser treats
// it as it treats any other unknown tag.
#ifndef OESDK_MESSAGES_OEOPENORDER_H
#define OESDK_MESSAGES_OEOPENORDER_H
#include "foundation/oeenums.h"
#include "messages/oeseclist.h"

// OO: the order itself. SRVRTID and MEMO belong to version 1, SRVRTID2 and MEMO2 to the others.
class OE_API OEOO : public OEAggregate {
public:
    explicit OEOO(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEString* GetFITId() const { return GetText(OETAG_FITID); }
    unsigned short SetFITId(const OEString& v) { return SetFromText(OETAG_FITID, v); }
    const OEString* GetServerTId() const { return GetText(OETAG_SRVRTID); }
    unsigned short SetServerTId(const OEString& v) { return SetFromText(OETAG_SRVRTID, v); }
    const OEString* GetServerTId2() const { return GetText(OETAG_SRVRTID2); }
    unsigned short SetServerTId2(const OEString& v) { return SetFromText(OETAG_SRVRTID2, v); }
    OESecID* GetSecID() const { return static_cast<OESecID*>(GetChildObj(OETAG_SECID)); }
    unsigned short SetSecID(OESecID* id) { return SetChildObj(OETAG_SECID, id); }
    const OEDateTime* GetDatePlaced() const { return GetDateTime(OETAG_DTPLACED); }
    unsigned short SetDatePlaced(const OEString& v) { return SetFromText(OETAG_DTPLACED, v); }
    unsigned short SetDatePlaced(const OEDateTime& v) { return SetDateTime(OETAG_DTPLACED, v); }
    const OEPrecisionInteger* GetUnits() const { return GetAmount(OETAG_UNITS); }
    unsigned short SetUnits(const OEString& v) { return SetFromText(OETAG_UNITS, v); }
    unsigned short SetUnits(const OEPrecisionInteger& v) { return SetAmount(OETAG_UNITS, v); }
    OESubAcct GetSubAcct() const { return static_cast<OESubAcct>(GetNumber(OETAG_SUBACCT)); }
    unsigned short SetSubAcct(const OEString& v) { return SetFromText(OETAG_SUBACCT, v); }
    unsigned short SetSubAcct(OESubAcct v) { return SetNumber(OETAG_SUBACCT, static_cast<unsigned long>(v)); }
    OEDuration GetDuration() const { return static_cast<OEDuration>(GetNumber(OETAG_DURATION)); }
    unsigned short SetDuration(const OEString& v) { return SetFromText(OETAG_DURATION, v); }
    unsigned short SetDuration(OEDuration v) {
        return SetNumber(OETAG_DURATION, static_cast<unsigned long>(v));
    }
    OERestriction GetRestriction() const { return static_cast<OERestriction>(GetNumber(OETAG_RESTRICTION)); }
    unsigned short SetRestriction(const OEString& v) { return SetFromText(OETAG_RESTRICTION, v); }
    unsigned short SetRestriction(OERestriction v) {
        return SetNumber(OETAG_RESTRICTION, static_cast<unsigned long>(v));
    }
    const OEPrecisionInteger* GetMinUnits() const { return GetAmount(OETAG_MINUNITS); }
    unsigned short SetMinUnits(const OEString& v) { return SetFromText(OETAG_MINUNITS, v); }
    unsigned short SetMinUnits(const OEPrecisionInteger& v) { return SetAmount(OETAG_MINUNITS, v); }
    const OEPrecisionInteger* GetLimitPrice() const { return GetAmount(OETAG_LIMITPRICE); }
    unsigned short SetLimitPrice(const OEString& v) { return SetFromText(OETAG_LIMITPRICE, v); }
    unsigned short SetLimitPrice(const OEPrecisionInteger& v) { return SetAmount(OETAG_LIMITPRICE, v); }
    const OEPrecisionInteger* GetStopPrice() const { return GetAmount(OETAG_STOPPRICE); }
    unsigned short SetStopPrice(const OEString& v) { return SetFromText(OETAG_STOPPRICE, v); }
    unsigned short SetStopPrice(const OEPrecisionInteger& v) { return SetAmount(OETAG_STOPPRICE, v); }
    const OEString* GetMemo() const { return GetText(OETAG_MEMO); }
    unsigned short SetMemo(const OEString& v) { return SetFromText(OETAG_MEMO, v); }
    const OEString* GetMemo2() const { return GetText(OETAG_MEMO2); }
    unsigned short SetMemo2(const OEString& v) { return SetFromText(OETAG_MEMO2, v); }
    OECurrency* GetCurrency() const { return static_cast<OECurrency*>(GetChildObj(OETAG_CURRENCY)); }
    unsigned short SetCurrency(OECurrency* c) { return SetChildObj(OETAG_CURRENCY, c); }

    OEString255 m_fitId;
    OEBoundedString<10> m_srvrTId;
    OEBoundedString<36> m_srvrTId2;
    OEOwnedChild m_secId;
    OEDateTime m_dtPlaced;
    OEPrecisionInteger m_units, m_minUnits, m_limitPrice, m_stopPrice;
    unsigned short m_subAcct = 0, m_duration = 0, m_restriction = 0;
    OEString255 m_memo;
    OEBoundedString<390> m_memo2;
    OEOwnedChild m_currency;
};

// The common part of the eleven kinds of order: the OO they all start with and the elements
// several of them share. A kind without one of those elements refuses to set it (0) and answers
// 0: only the fund and "other" orders and OOSWITCHMF have UNITTYPE; BUYTYPE belongs to OOBUYMF and
// OOBUYSTOCK, SELLTYPE to OOSELLMF and OOSELLSTOCK.
class OE_API OEOpenOrder : public OEAggregate {
public:
    explicit OEOpenOrder(unsigned short version = 0) : OEAggregate(version) {}
    OEOO* GetOO() const { return static_cast<OEOO*>(GetChildObj(OETAG_OO)); }
    unsigned short SetOO(OEOO* oo) { return SetChildObj(OETAG_OO, oo); }
    OEUnitType GetUnitType() const { return static_cast<OEUnitType>(GetNumber(OETAG_UNITTYPE)); }
    unsigned short SetUnitType(const OEString& v) { return SetFromText(OETAG_UNITTYPE, v); }
    unsigned short SetUnitType(OEUnitType v) {
        return SetNumber(OETAG_UNITTYPE, static_cast<unsigned long>(v));
    }
    OEBuyType GetBuyType() const { return static_cast<OEBuyType>(GetNumber(OETAG_BUYTYPE)); }
    unsigned short SetBuyType(const OEString& v) { return SetFromText(OETAG_BUYTYPE, v); }
    unsigned short SetBuyType(OEBuyType v) { return SetNumber(OETAG_BUYTYPE, static_cast<unsigned long>(v)); }
    OESellType GetSellType() const { return static_cast<OESellType>(GetNumber(OETAG_SELLTYPE)); }
    unsigned short SetSellType(const OEString& v) { return SetFromText(OETAG_SELLTYPE, v); }
    unsigned short SetSellType(OESellType v) {
        return SetNumber(OETAG_SELLTYPE, static_cast<unsigned long>(v));
    }

    OEOwnedChild m_oo;
    unsigned short m_unitType = 0, m_buyType = 0, m_sellType = 0;
};

// The kinds whose own elements are all shared ones (held by OEOpenOrder) differ only in their
// tables: OOBUYMF (BUYTYPE, UNITTYPE), OOBUYOTHER (UNITTYPE), OOBUYSTOCK (BUYTYPE), OOSELLDEBT (nothing
// beyond the OO), OOSELLOTHER (UNITTYPE) and OOSELLSTOCK (SELLTYPE).
#define OE_OPEN_ORDER_KIND(C)                                                                                \
    class OE_API C : public OEOpenOrder {                                                                    \
    public:                                                                                                  \
        explicit C(unsigned short version = 0);                                                              \
        const OEAggregateDesc& Describe() const override;                                                    \
    }
OE_OPEN_ORDER_KIND(OEOOBuyMF);
OE_OPEN_ORDER_KIND(OEOOBuyOther);
OE_OPEN_ORDER_KIND(OEOOBuyStock);
OE_OPEN_ORDER_KIND(OEOOSellDebt);
OE_OPEN_ORDER_KIND(OEOOSellOther);
OE_OPEN_ORDER_KIND(OEOOSellStock);
#undef OE_OPEN_ORDER_KIND

// OOBUYDEBT: a bond to buy, perhaps at auction.
class OE_API OEOOBuyDebt : public OEOpenOrder {
public:
    explicit OEOOBuyDebt(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    bool GetAuction() const { return GetNumber(OETAG_AUCTION) != 0; }
    unsigned short SetAuction(const OEString& v) { return SetFromText(OETAG_AUCTION, v); }
    unsigned short SetAuction(bool v) { return SetNumber(OETAG_AUCTION, v ? 1 : 0); }
    const OEDateTime* GetDateAuction() const { return GetDateTime(OETAG_DTAUCTION); }
    unsigned short SetDateAuction(const OEString& v) { return SetFromText(OETAG_DTAUCTION, v); }
    unsigned short SetDateAuction(const OEDateTime& v) { return SetDateTime(OETAG_DTAUCTION, v); }

    unsigned short m_auction = 0;
    OEDateTime m_dtAuction;
};

// OOBUYOPT: an option to buy.
class OE_API OEOOBuyOpt : public OEOpenOrder {
public:
    explicit OEOOBuyOpt(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEOptBuyType GetOptBuyType() const { return static_cast<OEOptBuyType>(GetNumber(OETAG_OPTBUYTYPE)); }
    unsigned short SetOptBuyType(const OEString& v) { return SetFromText(OETAG_OPTBUYTYPE, v); }
    unsigned short SetOptBuyType(OEOptBuyType v) {
        return SetNumber(OETAG_OPTBUYTYPE, static_cast<unsigned long>(v));
    }

    unsigned short m_optBuyType = 0;
};

// OOSELLMF: a fund to sell (SELLTYPE, UNITTYPE), perhaps the whole holding.
class OE_API OEOOSellMF : public OEOpenOrder {
public:
    explicit OEOOSellMF(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    bool GetSellAll() const { return GetNumber(OETAG_SELLALL) != 0; }
    unsigned short SetSellAll(const OEString& v) { return SetFromText(OETAG_SELLALL, v); }
    unsigned short SetSellAll(bool v) { return SetNumber(OETAG_SELLALL, v ? 1 : 0); }

    unsigned short m_sellAll = 0;
};

// OOSELLOPT: an option to sell.
class OE_API OEOOSellOpt : public OEOpenOrder {
public:
    explicit OEOOSellOpt(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEOptSellType GetOptSellType() const { return static_cast<OEOptSellType>(GetNumber(OETAG_OPTSELLTYPE)); }
    unsigned short SetOptSellType(const OEString& v) { return SetFromText(OETAG_OPTSELLTYPE, v); }
    unsigned short SetOptSellType(OEOptSellType v) {
        return SetNumber(OETAG_OPTSELLTYPE, static_cast<unsigned long>(v));
    }

    unsigned short m_optSellType = 0;
};

// OOSWITCHMF: a switch from the fund of the OO into the fund of its own SECID (UNITTYPE),
// perhaps of the whole holding. Only the tag OOSWITCHMF is read: the dictionary has no SWITCHMF.
class OE_API OEOOSwitchMF : public OEOpenOrder {
public:
    explicit OEOOSwitchMF(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OESecID* GetSecID() const { return static_cast<OESecID*>(GetChildObj(OETAG_SECID)); }
    unsigned short SetSecID(OESecID* id) { return SetChildObj(OETAG_SECID, id); }
    bool GetSwitchAll() const { return GetNumber(OETAG_SWITCHALL) != 0; }
    unsigned short SetSwitchAll(const OEString& v) { return SetFromText(OETAG_SWITCHALL, v); }
    unsigned short SetSwitchAll(bool v) { return SetNumber(OETAG_SWITCHALL, v ? 1 : 0); }

    OEOwnedChild m_secId;
    unsigned short m_switchAll = 0;
};

// INVOOLIST: any number of open orders of the eleven kinds, in document order.
class OE_API OEInvOOList : public OEMixedList {
public:
    explicit OEInvOOList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;

    unsigned short AppendOpenOrder(OEOpenOrder* order) { return AppendEntry(order); }
    OEOpenOrder* GetOpenOrder(unsigned short index) const {
        return static_cast<OEOpenOrder*>(m_entries.Get(index));
    }
    unsigned short GetNumOpenOrder() const { return m_entries.Entries(); }
    void DeleteAllOpenOrder() { DeleteAllEntries(); }
};

#endif
