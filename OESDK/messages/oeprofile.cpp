#include "messages/oeprofile.h"

namespace {

const char* const kPwType[] = {"FIXED", "ONETIME", "HWTOKEN"};

const OETagRow kCoreValid[] = {{OETAG_VER, OEVM_ALL, 0},
                               {OETAG_URL, OEVM_V1, 0},
                               {OETAG_URL2, OEVM_NOTV1, 0},
                               {OETAG_OFXSEC, OEVM_ALL, 0},
                               {OETAG_TRANSPSEC, OEVM_ALL, 0},
                               {OETAG_SIGNONREALM, OEVM_ALL, 0},
                               {OETAG_LANGUAGE, OEVM_ALL, 0},
                               {OETAG_COUNTRY, OEVM_NOTV1, 0},
                               {OETAG_SYNCMODE, OEVM_ALL, 0},
                               {OETAG_RESPFILEER, OEVM_ALL, 0},
                               {OETAG_SPNAME, OEVM_ALL, 0},
                               {OETAG_KEST_TIMEOUT, OEVM_ALL, 0},
                               {OETAG_KEST_MSSCERTID, OEVM_ALL, 0},
                               {OETAG_KEST_TYPE1CERTID, OEVM_ALL, 0}};
const OETagRow kCoreRequired[] = {
    {OETAG_VER, OEVM_ALL, 0},      {OETAG_URL, OEVM_V1, 0},        {OETAG_URL2, OEVM_NOTV1, 0},
    {OETAG_OFXSEC, OEVM_ALL, 0},   {OETAG_TRANSPSEC, OEVM_ALL, 0}, {OETAG_SIGNONREALM, OEVM_ALL, 0},
    {OETAG_LANGUAGE, OEVM_ALL, 0}, {OETAG_SYNCMODE, OEVM_ALL, 0},  {OETAG_RESPFILEER, OEVM_ALL, 0}};
const OEFieldRow kCoreFields[] = {
    {OETAG_VER, OEFK_SLONG, OE_MEMBER(OEMessageSetCore, m_ver), nullptr, nullptr},
    {OETAG_URL, OEFK_TEXT, OE_MEMBER(OEMessageSetCore, m_url), nullptr, nullptr},
    {OETAG_URL2, OEFK_TEXT, OE_MEMBER(OEMessageSetCore, m_url2), nullptr, nullptr},
    {OETAG_OFXSEC, OEFK_ENUM, OE_MEMBER(OEMessageSetCore, m_ofxSec), &OEKW_OFXSECURITY, nullptr},
    {OETAG_TRANSPSEC, OEFK_BOOL, OE_MEMBER(OEMessageSetCore, m_transpSec), nullptr, nullptr},
    {OETAG_SIGNONREALM, OEFK_TEXT, OE_MEMBER(OEMessageSetCore, m_signOnRealm), nullptr, nullptr},
    {OETAG_LANGUAGE, OEFK_TEXTLIST, OE_MEMBER(OEMessageSetCore, m_language), nullptr, nullptr},
    {OETAG_COUNTRY, OEFK_TEXTLIST, OE_MEMBER(OEMessageSetCore, m_country), nullptr, nullptr},
    {OETAG_SYNCMODE, OEFK_ENUM, OE_MEMBER(OEMessageSetCore, m_syncMode), &OEKW_SYNCMODE, nullptr},
    {OETAG_RESPFILEER, OEFK_BOOL, OE_MEMBER(OEMessageSetCore, m_respFileer), nullptr, nullptr},
    {OETAG_SPNAME, OEFK_TEXT, OE_MEMBER(OEMessageSetCore, m_spName), nullptr, nullptr},
    {OETAG_KEST_TIMEOUT, OEFK_ULONG, OE_MEMBER(OEMessageSetCore, m_kestTimeout), nullptr, nullptr},
    {OETAG_KEST_MSSCERTID, OEFK_TEXTLIST, OE_MEMBER(OEMessageSetCore, m_mssCertId), nullptr, nullptr},
    {OETAG_KEST_TYPE1CERTID, OEFK_TEXTLIST, OE_MEMBER(OEMessageSetCore, m_type1CertId), nullptr, nullptr},
};

const OETagRow kVersionValid[] = {{OETAG_MSGSETCORE, OEVM_ALL, 0}};
const OEFieldRow kVersionFields[] = {
    {OETAG_MSGSETCORE, OEFK_CHILD, OE_MEMBER(OEMessageSetVersion, m_core), nullptr,
     OE_MAKE(NewMessageSetCore)},
};

const OETagRow kProfileValid[] = {
    {OETAG_SIGNUPMSGSETV1, OEVM_ALL, 0},     {OETAG_SIGNUPMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_BANKMSGSETV1, OEVM_ALL, 0},       {OETAG_BANKMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_CREDITCARDMSGSETV1, OEVM_ALL, 0}, {OETAG_CREDITCARDMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_INVSTMTMSGSETV1, OEVM_ALL, 0},    {OETAG_SECLISTMSGSETV1, OEVM_ALL, 0},
    {OETAG_INVSTMTMSGSETV2, OEVM_NOTV1, 0},  {OETAG_SECLISTMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_INTERXFERMSGSETV1, OEVM_ALL, 0},  {OETAG_INTERXFERMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_WIREXFERMSGSETV1, OEVM_ALL, 0},   {OETAG_WIREXFERMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_BILLPAYMSGSETV1, OEVM_ALL, 0},    {OETAG_BILLPAYMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_EMAILMSGSETV1, OEVM_ALL, 0},      {OETAG_EMAILMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_PROFMSGSETV1, OEVM_ALL, 0},       {OETAG_PROFMSGSETV2, OEVM_NOTV1, 0},
    {OETAG_SIGNONMSGSETV1, OEVM_ALL, 0},     {OETAG_SIGNONMSGSETV2, OEVM_NOTV1, 0},
};
const OEFieldRow kProfileFields[] = {
    {OETAG_SIGNUPMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[0]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_SIGNUPMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[1]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_BANKMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[2]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_BANKMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[3]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_CREDITCARDMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[4]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_CREDITCARDMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[5]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_INVSTMTMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[6]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_SECLISTMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[7]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_INVSTMTMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[8]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_SECLISTMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[9]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_INTERXFERMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[10]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_INTERXFERMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[11]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_WIREXFERMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[12]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_WIREXFERMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[13]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_BILLPAYMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[14]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_BILLPAYMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[15]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_EMAILMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[16]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_EMAILMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[17]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_PROFMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[18]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_PROFMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[19]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_SIGNONMSGSETV1, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[20]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
    {OETAG_SIGNONMSGSETV2, OEFK_CHILD, OE_MEMBER(OEMessageSetProfile, m_versions[21]), nullptr,
     OE_MAKE(NewMessageSetVersion)},
};
const OETagRow kListValid[] = {
    {OETAG_SIGNUPMSGSET, OEVM_ALL, 0},     {OETAG_BANKMSGSET, OEVM_ALL, 0},
    {OETAG_CREDITCARDMSGSET, OEVM_ALL, 0}, {OETAG_INVSTMTMSGSET, OEVM_ALL, 0},
    {OETAG_SECLISTMSGSET, OEVM_ALL, 0},    {OETAG_INTERXFERMSGSET, OEVM_ALL, 0},
    {OETAG_WIREXFERMSGSET, OEVM_ALL, 0},   {OETAG_BILLPAYMSGSET, OEVM_ALL, 0},
    {OETAG_EMAILMSGSET, OEVM_ALL, 0},      {OETAG_PROFMSGSET, OEVM_ALL, 0},
    {OETAG_SIGNONMSGSET, OEVM_ALL, 0},
};
const OETagRow kListRequired[] = {{OETAG_SIGNONMSGSET, OEVM_ALL, 0}, {OETAG_PROFMSGSET, OEVM_ALL, 0}};
const OEFieldRow kListFields[] = {
    {OETAG_SIGNUPMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[0]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_BANKMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[1]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_CREDITCARDMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[2]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_INVSTMTMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[3]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_SECLISTMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[4]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_INTERXFERMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[5]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_WIREXFERMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[6]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_BILLPAYMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[7]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_EMAILMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[8]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_PROFMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[9]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
    {OETAG_SIGNONMSGSET, OEFK_CHILD, OE_MEMBER(OEMessageSetList, m_sets[10]), nullptr,
     OE_MAKE(NewMessageSetProfile)},
};

const OEAggregateDesc kCoreDesc = OE_DESC(OETAG_MSGSETCORE, kCoreValid, kCoreRequired, kCoreFields);
const OEAggregateDesc kVersionDesc = OE_DESC(OETAG_NONE, kVersionValid, kVersionValid, kVersionFields);
const OEAggregateDesc kProfileDesc = OE_DESC_NO_REQUIRED(OETAG_NONE, kProfileValid, kProfileFields);
const OEAggregateDesc kListDesc = OE_DESC(OETAG_MSGSETLIST, kListValid, kListRequired, kListFields);

// ---- SIGNONINFO / SIGNONINFOLIST ----
const OETagRow kInfoValid[] = {
    {OETAG_SIGNONREALM, OEVM_ALL, 0}, {OETAG_MIN, OEVM_ALL, 0},         {OETAG_MAX, OEVM_ALL, 0},
    {OETAG_CHARTYPE, OEVM_ALL, 0},    {OETAG_CASESEN, OEVM_ALL, 0},     {OETAG_SPECIAL, OEVM_ALL, 0},
    {OETAG_SPACES, OEVM_ALL, 0},      {OETAG_PINCH, OEVM_ALL, 0},       {OETAG_CHGPINFIRST, OEVM_ALL, 0},
    {OETAG_PWTYPE, OEVM_NOTV1, 0},    {OETAG_CLIENTUIDREQ, OEVM_ALL, 0}};
const OETagRow kInfoRequired[] = {{OETAG_SIGNONREALM, OEVM_ALL, 0}, {OETAG_MIN, OEVM_ALL, 0},
                                  {OETAG_MAX, OEVM_ALL, 0},         {OETAG_CHARTYPE, OEVM_ALL, 0},
                                  {OETAG_CASESEN, OEVM_ALL, 0},     {OETAG_SPECIAL, OEVM_ALL, 0},
                                  {OETAG_SPACES, OEVM_ALL, 0},      {OETAG_PINCH, OEVM_ALL, 0}};
const OEFieldRow kInfoFields[] = {
    {OETAG_SIGNONREALM, OEFK_TEXT, OE_MEMBER(OESignOnInfo, m_signOnRealm), nullptr, nullptr},
    {OETAG_MIN, OEFK_USHORT, OE_MEMBER(OESignOnInfo, m_min), nullptr, nullptr},
    {OETAG_MAX, OEFK_USHORT, OE_MEMBER(OESignOnInfo, m_max), nullptr, nullptr},
    {OETAG_CHARTYPE, OEFK_ENUM, OE_MEMBER(OESignOnInfo, m_charType), &OEKW_CHARTYPE, nullptr},
    {OETAG_CASESEN, OEFK_BOOL, OE_MEMBER(OESignOnInfo, m_caseSen), nullptr, nullptr},
    {OETAG_SPECIAL, OEFK_BOOL, OE_MEMBER(OESignOnInfo, m_special), nullptr, nullptr},
    {OETAG_SPACES, OEFK_BOOL, OE_MEMBER(OESignOnInfo, m_spaces), nullptr, nullptr},
    {OETAG_PINCH, OEFK_BOOL, OE_MEMBER(OESignOnInfo, m_pinCh), nullptr, nullptr},
    {OETAG_CHGPINFIRST, OEFK_BOOL, OE_MEMBER(OESignOnInfo, m_chgPinFirst), nullptr, nullptr},
    {OETAG_PWTYPE, OEFK_ENUM, OE_MEMBER(OESignOnInfo, m_pwType), &OEKW_PWTYPE, nullptr},
    {OETAG_CLIENTUIDREQ, OEFK_BOOL, OE_MEMBER(OESignOnInfo, m_clientUidReq), nullptr, nullptr},
};
const OETagRow kInfoListValid[] = {{OETAG_SIGNONINFO, OEVM_ALL, 0}};
const OEFieldRow kInfoListFields[] = {
    {OETAG_SIGNONINFO, OEFK_LIST, OE_MEMBER(OESignOnInfoList, m_infos), nullptr, OE_MAKE(NewSignOnInfo)},
};

// ---- PROFRQ / PROFRS ----
const OETagRow kProfRqValid[] = {{OETAG_CLIENTROUTING, OEVM_ALL, 0}, {OETAG_DTPROFUP, OEVM_ALL, 0}};
const OEFieldRow kProfRqFields[] = {
    {OETAG_CLIENTROUTING, OEFK_ENUM, OE_MEMBER(OEProfileRq, m_clientRouting), &OEKW_CLIENTROUTING, nullptr},
    {OETAG_DTPROFUP, OEFK_DATETIME, OE_MEMBER(OEProfileRq, m_dtProfUp), nullptr, nullptr},
};
const OETagRow kProfRsValid[] = {{OETAG_MSGSETLIST, OEVM_ALL, 0},
                                 {OETAG_SIGNONINFOLIST, OEVM_ALL, 0},
                                 {OETAG_DTPROFUP, OEVM_ALL, 0},
                                 {OETAG_FINAME, OEVM_ALL, 0},
                                 {OETAG_ADDR1, OEVM_ALL, 0},
                                 {OETAG_ADDR2, OEVM_ALL, 0},
                                 {OETAG_ADDR3, OEVM_ALL, 0},
                                 {OETAG_CITY, OEVM_ALL, 0},
                                 {OETAG_STATE, OEVM_ALL, 0},
                                 {OETAG_POSTALCODE, OEVM_ALL, 0},
                                 {OETAG_COUNTRY, OEVM_ALL, 0},
                                 {OETAG_CSPHONE, OEVM_ALL, 0},
                                 {OETAG_TSPHONE, OEVM_ALL, 0},
                                 {OETAG_FAXPHONE, OEVM_ALL, 0},
                                 {OETAG_URL, OEVM_V1, 0},
                                 {OETAG_URL2, OEVM_NOTV1, 0},
                                 {OETAG_URLGETREDIRECT, OEVM_NOTV1, 0},
                                 {OETAG_EMAIL, OEVM_ALL, 0}};
const OETagRow kProfRsRequired[] = {
    {OETAG_MSGSETLIST, OEVM_ALL, 0}, {OETAG_SIGNONINFOLIST, OEVM_ALL, 0}, {OETAG_DTPROFUP, OEVM_ALL, 0},
    {OETAG_FINAME, OEVM_ALL, 0},     {OETAG_ADDR1, OEVM_ALL, 0},          {OETAG_CITY, OEVM_ALL, 0},
    {OETAG_STATE, OEVM_ALL, 0},      {OETAG_POSTALCODE, OEVM_ALL, 0},     {OETAG_COUNTRY, OEVM_ALL, 0}};
const OEFieldRow kProfRsFields[] = {
    {OETAG_MSGSETLIST, OEFK_CHILD, OE_MEMBER(OEProfileRs, m_msgSetList), nullptr, OE_MAKE(NewMessageSetList)},
    {OETAG_SIGNONINFOLIST, OEFK_CHILD, OE_MEMBER(OEProfileRs, m_signOnInfoList), nullptr,
     OE_MAKE(NewSignOnInfoList)},
    {OETAG_DTPROFUP, OEFK_DATETIME, OE_MEMBER(OEProfileRs, m_dtProfUp), nullptr, nullptr},
    {OETAG_FINAME, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_fiName), nullptr, nullptr},
    {OETAG_ADDR1, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_addr1), nullptr, nullptr},
    {OETAG_ADDR2, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_addr2), nullptr, nullptr},
    {OETAG_ADDR3, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_addr3), nullptr, nullptr},
    {OETAG_CITY, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_city), nullptr, nullptr},
    {OETAG_STATE, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_state), nullptr, nullptr},
    {OETAG_POSTALCODE, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_postalCode), nullptr, nullptr},
    {OETAG_COUNTRY, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_country), nullptr, nullptr},
    {OETAG_CSPHONE, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_csPhone), nullptr, nullptr},
    {OETAG_TSPHONE, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_tsPhone), nullptr, nullptr},
    {OETAG_FAXPHONE, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_faxPhone), nullptr, nullptr},
    {OETAG_URL, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_url), nullptr, nullptr},
    {OETAG_URL2, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_url2), nullptr, nullptr},
    {OETAG_URLGETREDIRECT, OEFK_BOOL, OE_MEMBER(OEProfileRs, m_urlGetRedirect), nullptr, nullptr},
    {OETAG_EMAIL, OEFK_TEXT, OE_MEMBER(OEProfileRs, m_email), nullptr, nullptr},
};

const OEAggregateDesc kInfoDesc = OE_DESC(OETAG_SIGNONINFO, kInfoValid, kInfoRequired, kInfoFields);
// An empty list of realms is complete: the list row is valid, nothing is required.
const OEAggregateDesc kInfoListDesc =
    OE_DESC_NO_REQUIRED(OETAG_SIGNONINFOLIST, kInfoListValid, kInfoListFields);
// Both elements of the request are required: the valid rows serve as the required ones.
const OEAggregateDesc kProfRqDesc = OE_DESC(OETAG_PROFRQ, kProfRqValid, kProfRqValid, kProfRqFields);
const OEAggregateDesc kProfRsDesc = OE_DESC(OETAG_PROFRS, kProfRsValid, kProfRsRequired, kProfRsFields);

} // namespace

const OEKeywordTable OEKW_PWTYPE = {kPwType, 3};

OEMessageSetCore::OEMessageSetCore(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_MSGSETCORE);
}
const OEAggregateDesc& OEMessageSetCore::Describe() const {
    return kCoreDesc;
}

OEMessageSetVersion::OEMessageSetVersion(unsigned short version) : OEAggregate(version) {}
const OEAggregateDesc& OEMessageSetVersion::Describe() const {
    return kVersionDesc;
}

OEMessageSetProfile::OEMessageSetProfile(unsigned short version) : OEAggregate(version) {}
const OEAggregateDesc& OEMessageSetProfile::Describe() const {
    return kProfileDesc;
}

OEMessageSetVersion* OEMessageSetProfile::NewMsgSetVersion(OETagID tag, unsigned short version) {
    const OEFieldRow* row = FindRow(tag);
    OEDataObjFactory* factory = GetFactory();
    if (!row || !factory) return nullptr;
    OEMessageSetVersion* v = factory->NewMessageSetVersion(version);
    if (!v) return nullptr;
    v->SetType(tag);
    if (!SetChildObj(tag, v)) {
        delete v;
        return nullptr;
    }
    return v;
}

OEMessageSetList::OEMessageSetList(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_MSGSETLIST);
}
const OEAggregateDesc& OEMessageSetList::Describe() const {
    return kListDesc;
}

OESignOnInfo::OESignOnInfo(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_SIGNONINFO);
}
const OEAggregateDesc& OESignOnInfo::Describe() const {
    return kInfoDesc;
}

OESignOnInfoList::OESignOnInfoList(unsigned short version) : OEAggregate(version), m_infos(1, 4) {
    SetType(OETAG_SIGNONINFOLIST);
}
const OEAggregateDesc& OESignOnInfoList::Describe() const {
    return kInfoListDesc;
}

OEProfileRq::OEProfileRq(unsigned short version) : OETransBase(version) {
    SetType(OETAG_PROFRQ);
}
const OEAggregateDesc& OEProfileRq::Describe() const {
    return kProfRqDesc;
}

OEProfileRs::OEProfileRs(unsigned short version) : OETransBase(version) {
    SetType(OETAG_PROFRS);
}
const OEAggregateDesc& OEProfileRs::Describe() const {
    return kProfRsDesc;
}

unsigned short OEProfileRs::AllRequiredPresent() {
    if (!OEAggregate::AllRequiredPresent()) return 0;
    return ValidateTag(OETAG_ADDR3) && !ValidateTag(OETAG_ADDR2) ? 0 : 1;
}
