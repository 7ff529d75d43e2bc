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
    const OEString* GetOrg() const { return GetText(OETAG_ORG); }
    unsigned short SetOrg(const OEString& v) { return SetFromText(OETAG_ORG, v); }
    const OEString* GetFId() const { return GetText(OETAG_FID); }
    unsigned short SetFId(const OEString& v) { return SetFromText(OETAG_FID, v); }

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

    const OEString* GetAppId() const { return GetText(OETAG_APPID); }
    unsigned short SetAppId(const OEString& v) { return SetFromText(OETAG_APPID, v); }
    unsigned short GetAppVer() const { return static_cast<unsigned short>(GetNumber(OETAG_APPVER)); }
    unsigned short SetAppVer(const OEString& v) { return SetFromText(OETAG_APPVER, v); }
    unsigned short SetAppVer(unsigned short v) { return SetNumber(OETAG_APPVER, v); }
    const OEString* GetClientUId() const { return GetText(OETAG_CLIENTUID); }
    unsigned short SetClientUId(const OEString& v) { return SetFromText(OETAG_CLIENTUID, v); }
    const OEString* GetCountry() const { return GetText(OETAG_COUNTRY); }
    unsigned short SetCountry(const OEString& v) { return SetFromText(OETAG_COUNTRY, v); }
    const OEDateTime* GetDtClient() const { return GetDateTime(OETAG_DTCLIENT); }
    unsigned short SetDtClient(const OEString& v) { return SetFromText(OETAG_DTCLIENT, v); }
    unsigned short SetDtClient(const OEDateTime& v) { return SetDateTime(OETAG_DTCLIENT, v); }
    OEFI* GetFI() const { return static_cast<OEFI*>(GetChildObj(OETAG_FI)); }
    unsigned short SetFI(OEFI* fi) { return SetChildObj(OETAG_FI, fi); }
    unsigned short GetGenUserKey() const { return static_cast<unsigned short>(GetNumber(OETAG_GENUSERKEY)); }
    unsigned short SetGenUserKey(const OEString& v) { return SetFromText(OETAG_GENUSERKEY, v); }
    unsigned short SetGenUserKey(unsigned short v) { return SetNumber(OETAG_GENUSERKEY, v); }
    const OEString* GetLanguage() const { return GetText(OETAG_LANGUAGE); }
    unsigned short SetLanguage(const OEString& v) { return SetFromText(OETAG_LANGUAGE, v); }
    const OEString* GetSessCookie() const { return GetText(OETAG_SESSCOOKIE); }
    unsigned short SetSessCookie(const OEString& v) { return SetFromText(OETAG_SESSCOOKIE, v); }
    const OEString* GetUserId() const { return GetText(OETAG_USERID); }
    unsigned short SetUserId(const OEString& v) { return SetFromText(OETAG_USERID, v); }
    const OEString* GetUserKey() const { return GetText(OETAG_USERKEY); }
    unsigned short SetUserKey(const OEString& v) { return SetFromText(OETAG_USERKEY, v); }
    // Write-only: there is no getter for the password; Build writes it.
    unsigned short SetUserPass(const OEString& v) { return SetFromText(OETAG_USERPASS, v); }
    unsigned short SetOneTimePass(const OEString& v) { return SetFromText(OETAG_ONETIMEPASS, v); }

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
    OEStatus* GetStatus() const { return static_cast<OEStatus*>(GetChildObj(OETAG_STATUS)); }
    unsigned short SetStatus(OEStatus* s) { return SetChildObj(OETAG_STATUS, s); }
    OEFI* GetFI() const { return static_cast<OEFI*>(GetChildObj(OETAG_FI)); }
    unsigned short SetFI(OEFI* fi) { return SetChildObj(OETAG_FI, fi); }
    const OEDateTime* GetDtServer() const { return GetDateTime(OETAG_DTSERVER); }
    unsigned short SetDtServer(const OEString& v) { return SetFromText(OETAG_DTSERVER, v); }
    unsigned short SetDtServer(const OEDateTime& v) { return SetDateTime(OETAG_DTSERVER, v); }
    const OEDateTime* GetDtProfUp() const { return GetDateTime(OETAG_DTPROFUP); }
    unsigned short SetDtProfUp(const OEString& v) { return SetFromText(OETAG_DTPROFUP, v); }
    const OEDateTime* GetDtAcctUp() const { return GetDateTime(OETAG_DTACCTUP); }
    unsigned short SetDtAcctUp(const OEString& v) { return SetFromText(OETAG_DTACCTUP, v); }
    const OEDateTime* GetTsKeyExpire() const { return GetDateTime(OETAG_TSKEYEXPIRE); }
    unsigned short SetTsKeyExpire(const OEString& v) { return SetFromText(OETAG_TSKEYEXPIRE, v); }
    const OEString* GetLanguage() const { return GetText(OETAG_LANGUAGE); }
    unsigned short SetLanguage(const OEString& v) { return SetFromText(OETAG_LANGUAGE, v); }
    const OEString* GetCountry() const { return GetText(OETAG_COUNTRY); }
    unsigned short SetCountry(const OEString& v) { return SetFromText(OETAG_COUNTRY, v); }
    const OEString* GetUserKey() const { return GetText(OETAG_USERKEY); }
    unsigned short SetUserKey(const OEString& v) { return SetFromText(OETAG_USERKEY, v); }
    unsigned short SetSessCookie(const OEString& v) { return SetFromText(OETAG_SESSCOOKIE, v); }
    unsigned long GetKestBid() const { return GetNumber(OETAG_KEST_BID); }
    unsigned short SetKestBid(unsigned long v) { return SetNumber(OETAG_KEST_BID, v); }
    unsigned long GetKestPid() const { return GetNumber(OETAG_KEST_PRESENCEID); }
    unsigned short SetKestPid(unsigned long v) { return SetNumber(OETAG_KEST_PRESENCEID, v); }
    const OEString* GetKestUserId() const { return GetText(OETAG_KEST_USERID); }
    unsigned short SetKestUserId(const OEString& v) { return SetFromText(OETAG_KEST_USERID, v); }
    unsigned short SetKestMktCookie(const OEString& v) { return SetFromText(OETAG_KEST_MKTCOOKIE, v); }

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
    const OEString* GetUserId() const { return GetText(OETAG_USERID); }
    unsigned short SetUserId(const OEString& v) { return SetFromText(OETAG_USERID, v); }
    unsigned short SetNewUserPass(const OEString& v) { return SetFromText(OETAG_NEWUSERPASS, v); }

    OEString32 m_userId;
    OEPassword m_newUserPass;
};

// PINCHRS: USERID (required) and DTCHANGED.
class OE_API OEPinChangeRs : public OETransBase {
public:
    explicit OEPinChangeRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEString* GetUserId() const { return GetText(OETAG_USERID); }
    unsigned short SetUserId(const OEString& v) { return SetFromText(OETAG_USERID, v); }
    const OEDateTime* GetDateTimeChanged() const { return GetDateTime(OETAG_DTCHANGED); }
    unsigned short SetDateTimeChanged(const OEString& v) { return SetFromText(OETAG_DTCHANGED, v); }
    unsigned short SetDateTimeChanged(const OEDateTime& v) { return SetDateTime(OETAG_DTCHANGED, v); }

    OEString32 m_userId;
    OEDateTime m_dtChanged;
};

#endif
