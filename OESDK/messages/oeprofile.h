// The message-set part of a profile response: MSGSETLIST, the per-message-set aggregates
// (BANKMSGSET ...), their versions (BANKMSGSETV1 ...) and MSGSETCORE.
#ifndef OESDK_MESSAGES_OEPROFILE_H
#define OESDK_MESSAGES_OEPROFILE_H
#include "messages/oeaggregate.h"

extern OE_API const OEKeywordTable OEKW_OFXSECURITY; // "NONE", "TYPE1"
extern OE_API const OEKeywordTable OEKW_SYNCMODE;    // "FULL", "LITE"

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

#endif
