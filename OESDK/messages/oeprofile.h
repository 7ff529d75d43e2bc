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
    OE_TEXT_ACCESSORS(URL, OETAG_URL);
    OE_TEXT_ACCESSORS(URL2, OETAG_URL2);
    OE_NUMBER_ACCESSORS(OFXSecurity, unsigned short, OETAG_OFXSEC);
    OE_NUMBER_ACCESSORS(TransportSecurity, unsigned short, OETAG_TRANSPSEC);
    OE_TEXT_ACCESSORS(SignOnRealm, OETAG_SIGNONREALM);
    OE_NUMBER_ACCESSORS(SyncMode, unsigned short, OETAG_SYNCMODE);
    OE_NUMBER_ACCESSORS(RespFileer, unsigned short, OETAG_RESPFILEER);
    OE_TEXT_ACCESSORS(ServiceProviderName, OETAG_SPNAME);
    OE_NUMBER_ACCESSORS(KestTimeout, unsigned long, OETAG_KEST_TIMEOUT);
    // The repeated elements.
    OE_TEXTLIST_ACCESSORS(Language, OETAG_LANGUAGE, m_language);
    OE_TEXTLIST_ACCESSORS(Country, OETAG_COUNTRY, m_country);
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
    OE_CHILD_ACCESSORS(MessageSetCore, OEMessageSetCore, OETAG_MSGSETCORE);

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
    OE_TEXT_ACCESSORS(SignOnRealm, OETAG_SIGNONREALM);
    OE_NUMBER_ACCESSORS(Min, unsigned short, OETAG_MIN);
    OE_NUMBER_ACCESSORS(Max, unsigned short, OETAG_MAX);
    // CHARTYPE as an index of OEKW_CHARTYPE (the order of OECharacterType).
    OE_NUMBER_ACCESSORS(CharType, unsigned short, OETAG_CHARTYPE);
    OE_NUMBER_ACCESSORS(CaseSensitive, unsigned short, OETAG_CASESEN);
    OE_NUMBER_ACCESSORS(Special, unsigned short, OETAG_SPECIAL);
    OE_NUMBER_ACCESSORS(Spaces, unsigned short, OETAG_SPACES);
    OE_NUMBER_ACCESSORS(PinChange, unsigned short, OETAG_PINCH);
    OE_NUMBER_ACCESSORS(ChangePinFirst, unsigned short, OETAG_CHGPINFIRST);
    // PWTYPE (every version but 1) as an index of OEKW_PWTYPE.
    OE_NUMBER_ACCESSORS(PasswordType, unsigned short, OETAG_PWTYPE);
    OE_NUMBER_ACCESSORS(ClientUIdRequired, unsigned short, OETAG_CLIENTUIDREQ);

    OEString32 m_signOnRealm;
    unsigned short m_min = 0, m_max = 0, m_charType = 0, m_caseSen = 0, m_special = 0, m_spaces = 0;
    unsigned short m_pinCh = 0, m_chgPinFirst = 0, m_pwType = 0, m_clientUidReq = 0;
};

// SIGNONINFOLIST: the sign-on realms in order.
class OE_API OESignOnInfoList : public OEAggregate {
public:
    explicit OESignOnInfoList(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ACCESSORS(SignOnInfo, OESignOnInfo, OETAG_SIGNONINFO, m_infos);
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
    OE_NUMBER_ACCESSORS(ClientRouting, unsigned short, OETAG_CLIENTROUTING);
    OE_DATE_ACCESSORS(DtProfUp, OETAG_DTPROFUP);

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
    OE_CHILD_ACCESSORS(MessageSetList, OEMessageSetList, OETAG_MSGSETLIST);
    OE_CHILD_ACCESSORS(SignOnInfoList, OESignOnInfoList, OETAG_SIGNONINFOLIST);
    OE_DATE_ACCESSORS(DtProfUp, OETAG_DTPROFUP);
    OE_TEXT_ACCESSORS(FIName, OETAG_FINAME);
    OE_TEXT_ACCESSORS(Addr1, OETAG_ADDR1);
    OE_TEXT_ACCESSORS(Addr2, OETAG_ADDR2);
    OE_TEXT_ACCESSORS(Addr3, OETAG_ADDR3);
    OE_TEXT_ACCESSORS(City, OETAG_CITY);
    OE_TEXT_ACCESSORS(State, OETAG_STATE);
    OE_TEXT_ACCESSORS(PostalCode, OETAG_POSTALCODE);
    OE_TEXT_ACCESSORS(Country, OETAG_COUNTRY);
    OE_TEXT_ACCESSORS(CustomerServicePhone, OETAG_CSPHONE);
    OE_TEXT_ACCESSORS(TechnicalSupportPhone, OETAG_TSPHONE);
    OE_TEXT_ACCESSORS(FaxPhone, OETAG_FAXPHONE);
    // URL in version 1, URL2 and URLGETREDIRECT in the later versions.
    OE_TEXT_ACCESSORS(URL, OETAG_URL);
    OE_TEXT_ACCESSORS(URL2, OETAG_URL2);
    OE_NUMBER_ACCESSORS(URLGetRedirect, unsigned short, OETAG_URLGETREDIRECT);
    OE_TEXT_ACCESSORS(EMail, OETAG_EMAIL);

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
