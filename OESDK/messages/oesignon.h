// Sign-on: SONRQ, SONRS, FI and the password change pair PINCHRQ / PINCHRS.
#ifndef OESDK_MESSAGES_OESIGNON_H
#define OESDK_MESSAGES_OESIGNON_H
#include "messages/oetrans.h"
#include "foundation/oelanguage.h"

// A password: at most 171 characters, never handed out by a getter, and its storage is
// overwritten with zeros before it is freed.
class OE_API OEPassword : public OEBoundedString<171> {
public:
    OEPassword() {}
    OEPassword(const OEPassword&) = delete;
    OEPassword& operator=(const OEPassword&) = delete;
    using OEBoundedString<171>::operator=;
    ~OEPassword() override;
};

// FI: ORG (required) and FID.
class OE_API OEFI : public OEAggregate {
public:
    explicit OEFI(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(Org, OETAG_ORG);
    OE_TEXT_ACCESSORS(FId, OETAG_FID);

    OEString32 m_org, m_fid;
};

class OE_API OESignOnRq : public OEAggregate {
public:
    explicit OESignOnRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // The generic required rows, then USERID with USERPASS, or USERKEY.
    unsigned short AllRequiredPresent() override;
    // Elements with a tag beyond the last dictionary row are refused (4).
    OEParseStatus HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) override;
    using OEAggregate::HandleTagElement;

    OE_TEXT_ACCESSORS(AppId, OETAG_APPID);
    OE_NUMBER_ACCESSORS(AppVer, unsigned short, OETAG_APPVER);
    OE_TEXT_ACCESSORS(ClientUId, OETAG_CLIENTUID);
    OE_TEXT_ACCESSORS(Country, OETAG_COUNTRY);
    OE_DATE_ACCESSORS(DtClient, OETAG_DTCLIENT);
    OE_CHILD_ACCESSORS(FI, OEFI, OETAG_FI);
    OE_NUMBER_ACCESSORS(GenUserKey, unsigned short, OETAG_GENUSERKEY);
    OE_TEXT_ACCESSORS(Language, OETAG_LANGUAGE);
    OE_TEXT_ACCESSORS(SessCookie, OETAG_SESSCOOKIE);
    OE_TEXT_ACCESSORS(UserId, OETAG_USERID);
    OE_TEXT_ACCESSORS(UserKey, OETAG_USERKEY);
    // Write-only: there is no getter for the password; Build writes it.
    OE_SET_FROM_TEXT(UserPass, OETAG_USERPASS);
    OE_SET_FROM_TEXT(OneTimePass, OETAG_ONETIMEPASS);

    OEOwnedChild m_fi;
    OEDateTime m_dtClient;
    OELanguage m_language;
    OEBoundedString<5> m_appId;
    unsigned short m_appVer = 0;
    OEString32 m_clientUid;
    OEString32 m_userId;
    OEPassword m_userPass;
    OEString32 m_oneTimePass;
    OEBoundedString<64> m_userKey;
    unsigned short m_genUserKey = 0;
    OEBoundedString<1000> m_sessCookie;
    OEString3 m_country;
};

class OE_API OESignOnRs : public OEAggregate {
public:
    explicit OESignOnRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_CHILD_ACCESSORS(Status, OEStatus, OETAG_STATUS);
    OE_CHILD_ACCESSORS(FI, OEFI, OETAG_FI);
    OE_DATE_ACCESSORS(DtServer, OETAG_DTSERVER);
    OE_DATE_TEXT_ACCESSORS(DtProfUp, OETAG_DTPROFUP);
    OE_DATE_TEXT_ACCESSORS(DtAcctUp, OETAG_DTACCTUP);
    OE_DATE_TEXT_ACCESSORS(TsKeyExpire, OETAG_TSKEYEXPIRE);
    OE_TEXT_ACCESSORS(Language, OETAG_LANGUAGE);
    OE_TEXT_ACCESSORS(Country, OETAG_COUNTRY);
    OE_TEXT_ACCESSORS(UserKey, OETAG_USERKEY);
    OE_SET_FROM_TEXT(SessCookie, OETAG_SESSCOOKIE);
    OE_NUMBER_VALUE_ACCESSORS(KestBid, unsigned long, OETAG_KEST_BID);
    OE_NUMBER_VALUE_ACCESSORS(KestPid, unsigned long, OETAG_KEST_PRESENCEID);
    OE_TEXT_ACCESSORS(KestUserId, OETAG_KEST_USERID);
    OE_SET_FROM_TEXT(KestMktCookie, OETAG_KEST_MKTCOOKIE);

    OEOwnedChild m_status, m_fi;
    OEDateTime m_dtServer, m_dtProfUp, m_dtAcctUp, m_tsKeyExpire;
    OELanguage m_language;
    OEBoundedString<64> m_userKey;
    OEBoundedString<1000> m_sessCookie;
    OEString3 m_country;
    OEBoundedString<80> m_kestMktCookie;
    OEString32 m_kestUserId;
    unsigned long m_kestBid = 0, m_kestPresenceId = 0;
};

// PINCHRQ: USERID and NEWUSERPASS, both required.
class OE_API OEPinChangeRq : public OETransBase {
public:
    explicit OEPinChangeRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(UserId, OETAG_USERID);
    OE_SET_FROM_TEXT(NewUserPass, OETAG_NEWUSERPASS);

    OEString32 m_userId;
    OEPassword m_newUserPass;
};

// PINCHRS: USERID (required) and DTCHANGED.
class OE_API OEPinChangeRs : public OETransBase {
public:
    explicit OEPinChangeRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(UserId, OETAG_USERID);
    OE_DATE_ACCESSORS(DateTimeChanged, OETAG_DTCHANGED);

    OEString32 m_userId;
    OEDateTime m_dtChanged;
};

#endif
