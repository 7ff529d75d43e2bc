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
    OE_TEXT_ACCESSORS(FITId, OETAG_FITID);
    OE_TEXT_ACCESSORS(ServerTId, OETAG_SRVRTID);
    OE_TEXT_ACCESSORS(ServerTId2, OETAG_SRVRTID2);
    OE_CHILD_ACCESSORS(SecID, OESecID, OETAG_SECID);
    OE_DATE_ACCESSORS(DatePlaced, OETAG_DTPLACED);
    OE_AMOUNT_ACCESSORS(Units, OETAG_UNITS);
    OE_NUMBER_ACCESSORS(SubAcct, OESubAcct, OETAG_SUBACCT);
    OE_NUMBER_ACCESSORS(Duration, OEDuration, OETAG_DURATION);
    OE_NUMBER_ACCESSORS(Restriction, OERestriction, OETAG_RESTRICTION);
    OE_AMOUNT_ACCESSORS(MinUnits, OETAG_MINUNITS);
    OE_AMOUNT_ACCESSORS(LimitPrice, OETAG_LIMITPRICE);
    OE_AMOUNT_ACCESSORS(StopPrice, OETAG_STOPPRICE);
    OE_TEXT_ACCESSORS(Memo, OETAG_MEMO);
    OE_TEXT_ACCESSORS(Memo2, OETAG_MEMO2);
    OE_CHILD_ACCESSORS(Currency, OECurrency, OETAG_CURRENCY);

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
    OE_CHILD_ACCESSORS(OO, OEOO, OETAG_OO);
    OE_NUMBER_ACCESSORS(UnitType, OEUnitType, OETAG_UNITTYPE);
    OE_NUMBER_ACCESSORS(BuyType, OEBuyType, OETAG_BUYTYPE);
    OE_NUMBER_ACCESSORS(SellType, OESellType, OETAG_SELLTYPE);

    OEOwnedChild m_oo;
    unsigned short m_unitType = 0, m_buyType = 0, m_sellType = 0;
};

// The kinds whose own elements are all shared ones (held by OEOpenOrder) differ only in their
// tables: OOBUYMF (BUYTYPE, UNITTYPE), OOBUYOTHER (UNITTYPE), OOBUYSTOCK (BUYTYPE), OOSELLDEBT (nothing
// beyond the OO), OOSELLOTHER (UNITTYPE) and OOSELLSTOCK (SELLTYPE).
OE_AGGREGATE_CLASS(OEOOBuyMF, OEOpenOrder);
OE_AGGREGATE_CLASS(OEOOBuyOther, OEOpenOrder);
OE_AGGREGATE_CLASS(OEOOBuyStock, OEOpenOrder);
OE_AGGREGATE_CLASS(OEOOSellDebt, OEOpenOrder);
OE_AGGREGATE_CLASS(OEOOSellOther, OEOpenOrder);
OE_AGGREGATE_CLASS(OEOOSellStock, OEOpenOrder);

// OOBUYDEBT: a bond to buy, perhaps at auction.
class OE_API OEOOBuyDebt : public OEOpenOrder {
public:
    explicit OEOOBuyDebt(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_ACCESSORS(Auction, bool, OETAG_AUCTION);
    OE_DATE_ACCESSORS(DateAuction, OETAG_DTAUCTION);

    unsigned short m_auction = 0;
    OEDateTime m_dtAuction;
};

// OOBUYOPT: an option to buy.
class OE_API OEOOBuyOpt : public OEOpenOrder {
public:
    explicit OEOOBuyOpt(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_ACCESSORS(OptBuyType, OEOptBuyType, OETAG_OPTBUYTYPE);

    unsigned short m_optBuyType = 0;
};

// OOSELLMF: a fund to sell (SELLTYPE, UNITTYPE), perhaps the whole holding.
class OE_API OEOOSellMF : public OEOpenOrder {
public:
    explicit OEOOSellMF(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_ACCESSORS(SellAll, bool, OETAG_SELLALL);

    unsigned short m_sellAll = 0;
};

// OOSELLOPT: an option to sell.
class OE_API OEOOSellOpt : public OEOpenOrder {
public:
    explicit OEOOSellOpt(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_ACCESSORS(OptSellType, OEOptSellType, OETAG_OPTSELLTYPE);

    unsigned short m_optSellType = 0;
};

// OOSWITCHMF: a switch from the fund of the OO into the fund of its own SECID (UNITTYPE),
// perhaps of the whole holding. Only the tag OOSWITCHMF is read: the dictionary has no SWITCHMF.
class OE_API OEOOSwitchMF : public OEOpenOrder {
public:
    explicit OEOOSwitchMF(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_CHILD_ACCESSORS(SecID, OESecID, OETAG_SECID);
    OE_NUMBER_ACCESSORS(SwitchAll, bool, OETAG_SWITCHALL);

    OEOwnedChild m_secId;
    unsigned short m_switchAll = 0;
};

// INVOOLIST: any number of open orders of the eleven kinds, in document order.
class OE_API OEInvOOList : public OEMixedList {
public:
    explicit OEInvOOList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;

    OE_ENTRY_ACCESSORS(OpenOrder, OEOpenOrder);
};

#endif
