// The profile request and response (PROFRQ, PROFRS) and what a profile response describes: the
// message sets (MSGSETLIST, the per-message-set aggregates BANKMSGSET ..., their versions
// BANKMSGSETV1 ... and MSGSETCORE) and the sign-on realms (SIGNONINFOLIST, SIGNONINFO).
#ifndef OESDK_MESSAGES_OEPROFILE_H
#define OESDK_MESSAGES_OEPROFILE_H
#include "messages/oetrans.h"

extern OE_API const OEKeywordTable OEKW_PWTYPE; // "FIXED", "ONETIME", "HWTOKEN"

// MSGSETCORE.
class OE_API OEMessageSetCore : public OEAggregate {
public:
    explicit OEMessageSetCore(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    long GetVer() const { return GetSigned(OETAG_VER); }
    unsigned short SetVer(const OEString& v) { return SetFromText(OETAG_VER, v); }
    unsigned short SetVer(long v) { return SetSigned(OETAG_VER, v); }
    const OEString* GetURL() const { return GetText(OETAG_URL); }
    unsigned short SetURL(const OEString& v) { return SetFromText(OETAG_URL, v); }
    const OEString* GetURL2() const { return GetText(OETAG_URL2); }
    unsigned short SetURL2(const OEString& v) { return SetFromText(OETAG_URL2, v); }
    unsigned short GetOFXSecurity() const { return static_cast<unsigned short>(GetNumber(OETAG_OFXSEC)); }
    unsigned short SetOFXSecurity(const OEString& v) { return SetFromText(OETAG_OFXSEC, v); }
    unsigned short SetOFXSecurity(unsigned short v) { return SetNumber(OETAG_OFXSEC, v); }
    unsigned short GetTransportSecurity() const {
        return static_cast<unsigned short>(GetNumber(OETAG_TRANSPSEC));
    }
    unsigned short SetTransportSecurity(const OEString& v) { return SetFromText(OETAG_TRANSPSEC, v); }
    unsigned short SetTransportSecurity(unsigned short v) { return SetNumber(OETAG_TRANSPSEC, v); }
    const OEString* GetSignOnRealm() const { return GetText(OETAG_SIGNONREALM); }
    unsigned short SetSignOnRealm(const OEString& v) { return SetFromText(OETAG_SIGNONREALM, v); }
    unsigned short GetSyncMode() const { return static_cast<unsigned short>(GetNumber(OETAG_SYNCMODE)); }
    unsigned short SetSyncMode(const OEString& v) { return SetFromText(OETAG_SYNCMODE, v); }
    unsigned short SetSyncMode(unsigned short v) { return SetNumber(OETAG_SYNCMODE, v); }
    unsigned short GetRespFileer() const { return static_cast<unsigned short>(GetNumber(OETAG_RESPFILEER)); }
    unsigned short SetRespFileer(const OEString& v) { return SetFromText(OETAG_RESPFILEER, v); }
    unsigned short SetRespFileer(unsigned short v) { return SetNumber(OETAG_RESPFILEER, v); }
    const OEString* GetServiceProviderName() const { return GetText(OETAG_SPNAME); }
    unsigned short SetServiceProviderName(const OEString& v) { return SetFromText(OETAG_SPNAME, v); }
    unsigned long GetKestTimeout() const { return GetNumber(OETAG_KEST_TIMEOUT); }
    unsigned short SetKestTimeout(const OEString& v) { return SetFromText(OETAG_KEST_TIMEOUT, v); }
    unsigned short SetKestTimeout(unsigned long v) { return SetNumber(OETAG_KEST_TIMEOUT, v); }
    // The repeated elements.
    unsigned short AppendLanguage(const OEString& v) { return AppendText(OETAG_LANGUAGE, v); }
    const OEString* GetLanguage(unsigned short i) const { return m_language.GetString(i); }
    unsigned short GetNumLanguage() const { return m_language.Entries(); }
    void DeleteAllLanguage() { m_language.DeleteAll(); }
    unsigned short AppendCountry(const OEString& v) { return AppendText(OETAG_COUNTRY, v); }
    const OEString* GetCountry(unsigned short i) const { return m_country.GetString(i); }
    unsigned short GetNumCountry() const { return m_country.Entries(); }
    void DeleteAllCountry() { m_country.DeleteAll(); }
    unsigned short AppendKestMSSCertID(const OEString& v) { return AppendText(OETAG_KEST_MSSCERTID, v); }
    unsigned short GetNumKestMSSCertID() const { return m_mssCertId.Entries(); }
    unsigned short AppendKestType1CertID(const OEString& v) { return AppendText(OETAG_KEST_TYPE1CERTID, v); }
    unsigned short GetNumKestType1CertID() const { return m_type1CertId.Entries(); }

    long m_ver = 0;
    OEString255 m_url, m_url2;
    unsigned short m_ofxSec = 0, m_transpSec = 0, m_syncMode = 0, m_respFileer = 0;
    OEString32 m_signOnRealm, m_spName;
    unsigned long m_kestTimeout = 0;
    OEDynamicArrayString m_language, m_country, m_mssCertId, m_type1CertId;
};

// One versioned message-set aggregate (BANKMSGSETV1, ...): exactly MSGSETCORE.
class OE_API OEMessageSetVersion : public OEAggregate {
public:
    explicit OEMessageSetVersion(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEMessageSetCore* GetMessageSetCore() const {
        return static_cast<OEMessageSetCore*>(GetChildObj(OETAG_MSGSETCORE));
    }
    unsigned short SetMessageSetCore(OEMessageSetCore* core) { return SetChildObj(OETAG_MSGSETCORE, core); }

    OEOwnedChild m_core;
};

// One per-message-set aggregate (BANKMSGSET, ...): its version entries.
class OE_API OEMessageSetProfile : public OEAggregate {
public:
    enum { kVersions = 22 };
    explicit OEMessageSetProfile(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // Creates (through the factory) and holds the version object of a versioned start tag such
    // as BANKMSGSETV1; null for another tag or when memory is short.
    OEMessageSetVersion* NewMsgSetVersion(OETagID tag, unsigned short version);
    OEMessageSetVersion* GetMsgSetVersionObj(OETagID tag) const {
        return static_cast<OEMessageSetVersion*>(GetChildObj(tag));
    }

    OEOwnedChild m_versions[kVersions];
};

// MSGSETLIST: the per-message-set aggregates; SIGNONMSGSET and PROFMSGSET are required.
class OE_API OEMessageSetList : public OEAggregate {
public:
    enum { kSets = 11 };
    explicit OEMessageSetList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OEMessageSetProfile* GetMessageSetProfile(OETagID tag) const {
        return static_cast<OEMessageSetProfile*>(GetChildObj(tag));
    }
    unsigned short SetMessageSetProfile(OEMessageSetProfile* p) {
        return p ? SetChildObj(p->GetType(), p) : 0;
    }

    OEOwnedChild m_sets[kSets];
};

// SIGNONINFO: the password rules of one sign-on realm.
class OE_API OESignOnInfo : public OEAggregate {
public:
    explicit OESignOnInfo(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEString* GetSignOnRealm() const { return GetText(OETAG_SIGNONREALM); }
    unsigned short SetSignOnRealm(const OEString& v) { return SetFromText(OETAG_SIGNONREALM, v); }
    unsigned short GetMin() const { return static_cast<unsigned short>(GetNumber(OETAG_MIN)); }
    unsigned short SetMin(const OEString& v) { return SetFromText(OETAG_MIN, v); }
    unsigned short SetMin(unsigned short v) { return SetNumber(OETAG_MIN, v); }
    unsigned short GetMax() const { return static_cast<unsigned short>(GetNumber(OETAG_MAX)); }
    unsigned short SetMax(const OEString& v) { return SetFromText(OETAG_MAX, v); }
    unsigned short SetMax(unsigned short v) { return SetNumber(OETAG_MAX, v); }
    // CHARTYPE as an index of OEKW_CHARTYPE (the order of OECharacterType).
    unsigned short GetCharType() const { return static_cast<unsigned short>(GetNumber(OETAG_CHARTYPE)); }
    unsigned short SetCharType(const OEString& v) { return SetFromText(OETAG_CHARTYPE, v); }
    unsigned short SetCharType(unsigned short v) { return SetNumber(OETAG_CHARTYPE, v); }
    unsigned short GetCaseSensitive() const { return static_cast<unsigned short>(GetNumber(OETAG_CASESEN)); }
    unsigned short SetCaseSensitive(const OEString& v) { return SetFromText(OETAG_CASESEN, v); }
    unsigned short SetCaseSensitive(unsigned short v) { return SetNumber(OETAG_CASESEN, v); }
    unsigned short GetSpecial() const { return static_cast<unsigned short>(GetNumber(OETAG_SPECIAL)); }
    unsigned short SetSpecial(const OEString& v) { return SetFromText(OETAG_SPECIAL, v); }
    unsigned short SetSpecial(unsigned short v) { return SetNumber(OETAG_SPECIAL, v); }
    unsigned short GetSpaces() const { return static_cast<unsigned short>(GetNumber(OETAG_SPACES)); }
    unsigned short SetSpaces(const OEString& v) { return SetFromText(OETAG_SPACES, v); }
    unsigned short SetSpaces(unsigned short v) { return SetNumber(OETAG_SPACES, v); }
    unsigned short GetPinChange() const { return static_cast<unsigned short>(GetNumber(OETAG_PINCH)); }
    unsigned short SetPinChange(const OEString& v) { return SetFromText(OETAG_PINCH, v); }
    unsigned short SetPinChange(unsigned short v) { return SetNumber(OETAG_PINCH, v); }
    unsigned short GetChangePinFirst() const {
        return static_cast<unsigned short>(GetNumber(OETAG_CHGPINFIRST));
    }
    unsigned short SetChangePinFirst(const OEString& v) { return SetFromText(OETAG_CHGPINFIRST, v); }
    unsigned short SetChangePinFirst(unsigned short v) { return SetNumber(OETAG_CHGPINFIRST, v); }
    // PWTYPE (every version but 1) as an index of OEKW_PWTYPE.
    unsigned short GetPasswordType() const { return static_cast<unsigned short>(GetNumber(OETAG_PWTYPE)); }
    unsigned short SetPasswordType(const OEString& v) { return SetFromText(OETAG_PWTYPE, v); }
    unsigned short SetPasswordType(unsigned short v) { return SetNumber(OETAG_PWTYPE, v); }
    unsigned short GetClientUIdRequired() const {
        return static_cast<unsigned short>(GetNumber(OETAG_CLIENTUIDREQ));
    }
    unsigned short SetClientUIdRequired(const OEString& v) { return SetFromText(OETAG_CLIENTUIDREQ, v); }
    unsigned short SetClientUIdRequired(unsigned short v) { return SetNumber(OETAG_CLIENTUIDREQ, v); }

    OEString32 m_signOnRealm;
    unsigned short m_min = 0, m_max = 0, m_charType = 0, m_caseSen = 0, m_special = 0, m_spaces = 0;
    unsigned short m_pinCh = 0, m_chgPinFirst = 0, m_pwType = 0, m_clientUidReq = 0;
};

// SIGNONINFOLIST: the sign-on realms in order.
class OE_API OESignOnInfoList : public OEAggregate {
public:
    explicit OESignOnInfoList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    unsigned short AppendSignOnInfo(OESignOnInfo* info) { return AppendToList(OETAG_SIGNONINFO, info); }
    OESignOnInfo* GetSignOnInfo(unsigned short index) const {
        return static_cast<OESignOnInfo*>(m_infos.Get(index));
    }
    unsigned short GetNumSignOnInfo() const { return m_infos.Entries(); }
    void DeleteAllSignOnInfo() {
        m_infos.DeleteAll();
        ClearTag(OETAG_SIGNONINFO);
    }

    OEDataObjList m_infos;
};

// PROFRQ: CLIENTROUTING and DTPROFUP, both required.
class OE_API OEProfileRq : public OETransBase {
public:
    explicit OEProfileRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // CLIENTROUTING as an index of OEKW_CLIENTROUTING (the order of OEClientRouting).
    unsigned short GetClientRouting() const {
        return static_cast<unsigned short>(GetNumber(OETAG_CLIENTROUTING));
    }
    unsigned short SetClientRouting(const OEString& v) { return SetFromText(OETAG_CLIENTROUTING, v); }
    unsigned short SetClientRouting(unsigned short v) { return SetNumber(OETAG_CLIENTROUTING, v); }
    const OEDateTime* GetDtProfUp() const { return GetDateTime(OETAG_DTPROFUP); }
    unsigned short SetDtProfUp(const OEString& v) { return SetFromText(OETAG_DTPROFUP, v); }
    unsigned short SetDtProfUp(const OEDateTime& v) { return SetDateTime(OETAG_DTPROFUP, v); }

    unsigned short m_clientRouting = 0;
    OEDateTime m_dtProfUp;
};

// PROFRS: the message sets and sign-on realms the institution offers, and how to reach it.
class OE_API OEProfileRs : public OETransBase {
public:
    explicit OEProfileRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // The required rows, and ADDR3 only together with ADDR2.
    unsigned short AllRequiredPresent() override;
    OEMessageSetList* GetMessageSetList() const {
        return static_cast<OEMessageSetList*>(GetChildObj(OETAG_MSGSETLIST));
    }
    unsigned short SetMessageSetList(OEMessageSetList* l) { return SetChildObj(OETAG_MSGSETLIST, l); }
    OESignOnInfoList* GetSignOnInfoList() const {
        return static_cast<OESignOnInfoList*>(GetChildObj(OETAG_SIGNONINFOLIST));
    }
    unsigned short SetSignOnInfoList(OESignOnInfoList* l) { return SetChildObj(OETAG_SIGNONINFOLIST, l); }
    const OEDateTime* GetDtProfUp() const { return GetDateTime(OETAG_DTPROFUP); }
    unsigned short SetDtProfUp(const OEString& v) { return SetFromText(OETAG_DTPROFUP, v); }
    unsigned short SetDtProfUp(const OEDateTime& v) { return SetDateTime(OETAG_DTPROFUP, v); }
    const OEString* GetFIName() const { return GetText(OETAG_FINAME); }
    unsigned short SetFIName(const OEString& v) { return SetFromText(OETAG_FINAME, v); }
    const OEString* GetAddr1() const { return GetText(OETAG_ADDR1); }
    unsigned short SetAddr1(const OEString& v) { return SetFromText(OETAG_ADDR1, v); }
    const OEString* GetAddr2() const { return GetText(OETAG_ADDR2); }
    unsigned short SetAddr2(const OEString& v) { return SetFromText(OETAG_ADDR2, v); }
    const OEString* GetAddr3() const { return GetText(OETAG_ADDR3); }
    unsigned short SetAddr3(const OEString& v) { return SetFromText(OETAG_ADDR3, v); }
    const OEString* GetCity() const { return GetText(OETAG_CITY); }
    unsigned short SetCity(const OEString& v) { return SetFromText(OETAG_CITY, v); }
    const OEString* GetState() const { return GetText(OETAG_STATE); }
    unsigned short SetState(const OEString& v) { return SetFromText(OETAG_STATE, v); }
    const OEString* GetPostalCode() const { return GetText(OETAG_POSTALCODE); }
    unsigned short SetPostalCode(const OEString& v) { return SetFromText(OETAG_POSTALCODE, v); }
    const OEString* GetCountry() const { return GetText(OETAG_COUNTRY); }
    unsigned short SetCountry(const OEString& v) { return SetFromText(OETAG_COUNTRY, v); }
    const OEString* GetCustomerServicePhone() const { return GetText(OETAG_CSPHONE); }
    unsigned short SetCustomerServicePhone(const OEString& v) { return SetFromText(OETAG_CSPHONE, v); }
    const OEString* GetTechnicalSupportPhone() const { return GetText(OETAG_TSPHONE); }
    unsigned short SetTechnicalSupportPhone(const OEString& v) { return SetFromText(OETAG_TSPHONE, v); }
    const OEString* GetFaxPhone() const { return GetText(OETAG_FAXPHONE); }
    unsigned short SetFaxPhone(const OEString& v) { return SetFromText(OETAG_FAXPHONE, v); }
    // URL in version 1, URL2 and URLGETREDIRECT in the later versions.
    const OEString* GetURL() const { return GetText(OETAG_URL); }
    unsigned short SetURL(const OEString& v) { return SetFromText(OETAG_URL, v); }
    const OEString* GetURL2() const { return GetText(OETAG_URL2); }
    unsigned short SetURL2(const OEString& v) { return SetFromText(OETAG_URL2, v); }
    unsigned short GetURLGetRedirect() const {
        return static_cast<unsigned short>(GetNumber(OETAG_URLGETREDIRECT));
    }
    unsigned short SetURLGetRedirect(const OEString& v) { return SetFromText(OETAG_URLGETREDIRECT, v); }
    unsigned short SetURLGetRedirect(unsigned short v) { return SetNumber(OETAG_URLGETREDIRECT, v); }
    const OEString* GetEMail() const { return GetText(OETAG_EMAIL); }
    unsigned short SetEMail(const OEString& v) { return SetFromText(OETAG_EMAIL, v); }

    OEOwnedChild m_msgSetList, m_signOnInfoList;
    OEDateTime m_dtProfUp;
    OEString32 m_fiName, m_addr1, m_addr2, m_addr3, m_city;
    OEBoundedString<5> m_state;
    OEBoundedString<11> m_postalCode;
    OEString3 m_country;
    OEString32 m_csPhone, m_tsPhone, m_faxPhone;
    OEString255 m_url;
    OEBoundedString<1024> m_url2;
    unsigned short m_urlGetRedirect = 0;
    OEBoundedString<80> m_email;
};

#endif
