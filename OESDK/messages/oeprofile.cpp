#include "messages/oeprofile.h"

namespace {

const char* const kOFXSec[] = {"NONE", "TYPE1"};
const char* const kSyncMode[] = {"FULL", "LITE"};

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

} // namespace

const OEKeywordTable OEKW_OFXSECURITY = {kOFXSec, 2};
const OEKeywordTable OEKW_SYNCMODE = {kSyncMode, 2};

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
    if (!SetChildObj(tag, v)) return nullptr;
    return v;
}

OEMessageSetList::OEMessageSetList(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_MSGSETLIST);
}
const OEAggregateDesc& OEMessageSetList::Describe() const {
    return kListDesc;
}
