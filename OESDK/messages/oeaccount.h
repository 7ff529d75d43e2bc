// Accounts, balances and payees: the small aggregates that statements are made of.
#ifndef OESDK_MESSAGES_OEACCOUNT_H
#define OESDK_MESSAGES_OEACCOUNT_H
#include "messages/oeaggregate.h"

// Keyword tables of the enumerations these aggregates hold (value i = keyword i).

// The common base of every account aggregate. The same class serves the FROM and the TO form; the
// tag is chosen when the object is made.
class OE_API OEAccount : public OEAggregate {
public:
    explicit OEAccount(unsigned short version = 0) : OEAggregate(version) {}
    // Gives the object the FROM (BANKACCTFROM, CCACCTFROM) or the TO tag of its kind.
    void NewAcctFrom() { SetType(FromTag()); }
    void NewAcctTo() { SetType(ToTag()); }
    virtual OETagID FromTag() const = 0;
    virtual OETagID ToTag() const = 0;
    OE_TEXT_ACCESSORS(AcctId, OETAG_ACCTID);
    OE_TEXT_ACCESSORS(AcctKey, OETAG_ACCTKEY);
};

class OE_API OEBankOrCCAccount : public OEAccount {
public:
    explicit OEBankOrCCAccount(unsigned short version = 0) : OEAccount(version) {}
};

// BANKACCTFROM / BANKACCTTO.
class OE_API OEBankAccount : public OEBankOrCCAccount {
public:
    explicit OEBankAccount(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OETagID FromTag() const override { return OETAG_BANKACCTFROM; }
    OETagID ToTag() const override { return OETAG_BANKACCTTO; }
    OE_TEXT_ACCESSORS(BankId, OETAG_BANKID);
    OE_TEXT_ACCESSORS(BranchId, OETAG_BRANCHID);
    // ACCTTYPE (version 1) as an index of OEKW_BANKACCOUNTTYPE.
    OE_NUMBER_ACCESSORS(AcctType, unsigned short, OETAG_ACCTTYPE);
    // ACCTTYPE2 (every version but 1) as an index of OEKW_BANKACCOUNTTYPE2.
    OE_NUMBER_ACCESSORS(AcctType2, unsigned short, OETAG_ACCTTYPE2);
    // The account type's keyword whichever element holds it, or null.
    const char* GetAcctTypeText() const;

    OEString m_bankId, m_branchId, m_acctId, m_acctKey;
    unsigned short m_acctType = 0, m_acctType2 = 0;
};

// CCACCTFROM / CCACCTTO.
class OE_API OECCAccount : public OEBankOrCCAccount {
public:
    explicit OECCAccount(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OETagID FromTag() const override { return OETAG_CCACCTFROM; }
    OETagID ToTag() const override { return OETAG_CCACCTTO; }

    OEString m_acctId, m_acctKey;
};

// The common form of LEDGERBAL and AVAILBAL: BALAMT and DTASOF, both required.
class OE_API OEBankBalance : public OEAggregate {
public:
    explicit OEBankBalance(unsigned short version = 0) : OEAggregate(version) {}
    const OEAggregateDesc& Describe() const override;
    OE_AMOUNT_ACCESSORS(BalanceAmount, OETAG_BALAMT);
    OE_DATE_ACCESSORS(DateAsOf, OETAG_DTASOF);

    OEPrecisionInteger m_balAmt;
    OEDateTime m_dtAsOf;
};

class OE_API OELedgerBalance : public OEBankBalance {
public:
    explicit OELedgerBalance(unsigned short version = 0) : OEBankBalance(version) {
        SetType(OETAG_LEDGERBAL);
    }
};

class OE_API OEAvailableBalance : public OEBankBalance {
public:
    explicit OEAvailableBalance(unsigned short version = 0) : OEBankBalance(version) {
        SetType(OETAG_AVAILBAL);
    }
};

// BAL: one named balance of a balance list.
class OE_API OEBalance : public OEAggregate {
public:
    explicit OEBalance(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(Name, OETAG_NAME);
    OE_TEXT_ACCESSORS(Description, OETAG_DESC);
    OE_NUMBER_ACCESSORS(BalanceType, unsigned short, OETAG_BALTYPE);
    OE_AMOUNT_ACCESSORS(Value, OETAG_VALUE);
    OE_DATE_TEXT_ACCESSORS(DateAsOf, OETAG_DTASOF);
    OEDataObj* GetCurrency() const { return GetChildObj(OETAG_CURRENCY); }
    OE_SET_CHILD(Currency, OEDataObj, OETAG_CURRENCY);

    OEString32 m_name;
    OEBoundedString<80> m_desc;
    unsigned short m_balType = 0;
    OEPrecisionInteger m_value;
    OEDateTime m_dtAsOf;
    OEOwnedChild m_currency;
};

// PAYEE (version 1) and PAYEE2 (version 2): the payee that a statement transaction may carry.
class OE_API OEPayee : public OEAggregate {
public:
    explicit OEPayee(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(Name, OETAG_NAME);
    OE_TEXT_ACCESSORS(Addr1, OETAG_ADDR1);
    OE_TEXT_ACCESSORS(City, OETAG_CITY);
    OE_TEXT_ACCESSORS(State, OETAG_STATE);
    OE_TEXT_ACCESSORS(PostalCode, OETAG_POSTALCODE);
    OE_TEXT_ACCESSORS(Phone, OETAG_PHONE);

    OEString32 m_name, m_addr1, m_addr2, m_addr3, m_city, m_phone;
    OEBoundedString<5> m_state;
    OEBoundedString<11> m_postalCode;
    OEString3 m_country;
};

// PAYEE2: the same elements, all optional but NAME.
OE_AGGREGATE_CLASS(OEPayee2, OEPayee);

#endif
