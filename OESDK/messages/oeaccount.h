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
    const OEString* GetAcctId() const { return GetText(OETAG_ACCTID); }
    unsigned short SetAcctId(const OEString& v) { return SetFromText(OETAG_ACCTID, v); }
    const OEString* GetAcctKey() const { return GetText(OETAG_ACCTKEY); }
    unsigned short SetAcctKey(const OEString& v) { return SetFromText(OETAG_ACCTKEY, v); }
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
    const OEString* GetBankId() const { return GetText(OETAG_BANKID); }
    unsigned short SetBankId(const OEString& v) { return SetFromText(OETAG_BANKID, v); }
    const OEString* GetBranchId() const { return GetText(OETAG_BRANCHID); }
    unsigned short SetBranchId(const OEString& v) { return SetFromText(OETAG_BRANCHID, v); }
    // ACCTTYPE (version 1) as an index of OEKW_BANKACCOUNTTYPE.
    unsigned short GetAcctType() const { return static_cast<unsigned short>(GetNumber(OETAG_ACCTTYPE)); }
    unsigned short SetAcctType(const OEString& v) { return SetFromText(OETAG_ACCTTYPE, v); }
    unsigned short SetAcctType(unsigned short v) { return SetNumber(OETAG_ACCTTYPE, v); }
    // ACCTTYPE2 (every version but 1) as an index of OEKW_BANKACCOUNTTYPE2.
    unsigned short GetAcctType2() const { return static_cast<unsigned short>(GetNumber(OETAG_ACCTTYPE2)); }
    unsigned short SetAcctType2(const OEString& v) { return SetFromText(OETAG_ACCTTYPE2, v); }
    unsigned short SetAcctType2(unsigned short v) { return SetNumber(OETAG_ACCTTYPE2, v); }
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
    const OEPrecisionInteger* GetBalanceAmount() const { return GetAmount(OETAG_BALAMT); }
    unsigned short SetBalanceAmount(const OEString& v) { return SetFromText(OETAG_BALAMT, v); }
    unsigned short SetBalanceAmount(const OEPrecisionInteger& v) { return SetAmount(OETAG_BALAMT, v); }
    const OEDateTime* GetDateAsOf() const { return GetDateTime(OETAG_DTASOF); }
    unsigned short SetDateAsOf(const OEString& v) { return SetFromText(OETAG_DTASOF, v); }
    unsigned short SetDateAsOf(const OEDateTime& v) { return SetDateTime(OETAG_DTASOF, v); }

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
    const OEString* GetName() const { return GetText(OETAG_NAME); }
    unsigned short SetName(const OEString& v) { return SetFromText(OETAG_NAME, v); }
    const OEString* GetDescription() const { return GetText(OETAG_DESC); }
    unsigned short SetDescription(const OEString& v) { return SetFromText(OETAG_DESC, v); }
    unsigned short GetBalanceType() const { return static_cast<unsigned short>(GetNumber(OETAG_BALTYPE)); }
    unsigned short SetBalanceType(const OEString& v) { return SetFromText(OETAG_BALTYPE, v); }
    unsigned short SetBalanceType(unsigned short v) { return SetNumber(OETAG_BALTYPE, v); }
    const OEPrecisionInteger* GetValue() const { return GetAmount(OETAG_VALUE); }
    unsigned short SetValue(const OEString& v) { return SetFromText(OETAG_VALUE, v); }
    unsigned short SetValue(const OEPrecisionInteger& v) { return SetAmount(OETAG_VALUE, v); }
    const OEDateTime* GetDateAsOf() const { return GetDateTime(OETAG_DTASOF); }
    unsigned short SetDateAsOf(const OEString& v) { return SetFromText(OETAG_DTASOF, v); }
    OEDataObj* GetCurrency() const { return GetChildObj(OETAG_CURRENCY); }
    unsigned short SetCurrency(OEDataObj* c) { return SetChildObj(OETAG_CURRENCY, c); }

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
    const OEString* GetName() const { return GetText(OETAG_NAME); }
    unsigned short SetName(const OEString& v) { return SetFromText(OETAG_NAME, v); }
    const OEString* GetAddr1() const { return GetText(OETAG_ADDR1); }
    unsigned short SetAddr1(const OEString& v) { return SetFromText(OETAG_ADDR1, v); }
    const OEString* GetCity() const { return GetText(OETAG_CITY); }
    unsigned short SetCity(const OEString& v) { return SetFromText(OETAG_CITY, v); }
    const OEString* GetState() const { return GetText(OETAG_STATE); }
    unsigned short SetState(const OEString& v) { return SetFromText(OETAG_STATE, v); }
    const OEString* GetPostalCode() const { return GetText(OETAG_POSTALCODE); }
    unsigned short SetPostalCode(const OEString& v) { return SetFromText(OETAG_POSTALCODE, v); }
    const OEString* GetPhone() const { return GetText(OETAG_PHONE); }
    unsigned short SetPhone(const OEString& v) { return SetFromText(OETAG_PHONE, v); }

    OEString32 m_name, m_addr1, m_addr2, m_addr3, m_city, m_phone;
    OEBoundedString<5> m_state;
    OEBoundedString<11> m_postalCode;
    OEString3 m_country;
};

// PAYEE2: the same elements, all optional but NAME.
class OE_API OEPayee2 : public OEPayee {
public:
    explicit OEPayee2(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

#endif
