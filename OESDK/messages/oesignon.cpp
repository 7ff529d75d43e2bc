#include "messages/oesignon.h"

namespace {

const OETagRow kFIValid[] = {{OETAG_ORG, OEVM_ALL, 0}, {OETAG_FID, OEVM_ALL, 0}};
const OETagRow kFIRequired[] = {{OETAG_ORG, OEVM_ALL, 0}};
const OEFieldRow kFIFields[] = {
    {OETAG_ORG, OEFK_TEXT, OE_MEMBER(OEFI, m_org), nullptr, nullptr},
    {OETAG_FID, OEFK_TEXT, OE_MEMBER(OEFI, m_fid), nullptr, nullptr},
};

const OETagRow kSonRqValid[] = {
    {OETAG_FI, OEVM_ALL, 0},         {OETAG_DTCLIENT, OEVM_ALL, 0},   {OETAG_LANGUAGE, OEVM_ALL, 0},
    {OETAG_APPID, OEVM_ALL, 0},      {OETAG_APPVER, OEVM_ALL, 0},     {OETAG_CLIENTUID, OEVM_ALL, 0},
    {OETAG_USERID, OEVM_ALL, 0},     {OETAG_USERPASS, OEVM_ALL, 0},   {OETAG_USERKEY, OEVM_ALL, 0},
    {OETAG_GENUSERKEY, OEVM_ALL, 0}, {OETAG_SESSCOOKIE, OEVM_ALL, 0}, {OETAG_ONETIMEPASS, OEVM_NOTV1, 0},
    {OETAG_COUNTRY, OEVM_NOTV1, 0}};
const OETagRow kSonRqRequired[] = {{OETAG_DTCLIENT, OEVM_ALL, 0},
                                   {OETAG_LANGUAGE, OEVM_ALL, 0},
                                   {OETAG_APPID, OEVM_ALL, 0},
                                   {OETAG_APPVER, OEVM_ALL, 0}};
// Build order: the FI aggregate comes after COUNTRY, not at the head.
const OEFieldRow kSonRqFields[] = {
    {OETAG_DTCLIENT, OEFK_DATETIME, OE_MEMBER(OESignOnRq, m_dtClient), nullptr, nullptr},
    {OETAG_USERID, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_userId), nullptr, nullptr},
    {OETAG_USERPASS, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_userPass), nullptr, nullptr},
    {OETAG_ONETIMEPASS, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_oneTimePass), nullptr, nullptr},
    {OETAG_USERKEY, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_userKey), nullptr, nullptr},
    {OETAG_GENUSERKEY, OEFK_BOOL, OE_MEMBER(OESignOnRq, m_genUserKey), nullptr, nullptr},
    {OETAG_LANGUAGE, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_language), nullptr, nullptr},
    {OETAG_COUNTRY, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_country), nullptr, nullptr},
    {OETAG_FI, OEFK_CHILD, OE_MEMBER(OESignOnRq, m_fi), nullptr, OE_MAKE(NewFI)},
    {OETAG_SESSCOOKIE, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_sessCookie), nullptr, nullptr},
    {OETAG_APPID, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_appId), nullptr, nullptr},
    {OETAG_APPVER, OEFK_USHORT, OE_MEMBER(OESignOnRq, m_appVer), nullptr, nullptr},
    {OETAG_CLIENTUID, OEFK_TEXT, OE_MEMBER(OESignOnRq, m_clientUid), nullptr, nullptr},
};

const OETagRow kSonRsValid[] = {
    {OETAG_STATUS, OEVM_ALL, 0},          {OETAG_FI, OEVM_ALL, 0},          {OETAG_DTSERVER, OEVM_ALL, 0},
    {OETAG_LANGUAGE, OEVM_ALL, 0},        {OETAG_DTPROFUP, OEVM_ALL, 0},    {OETAG_DTACCTUP, OEVM_ALL, 0},
    {OETAG_USERKEY, OEVM_ALL, 0},         {OETAG_TSKEYEXPIRE, OEVM_ALL, 0}, {OETAG_SESSCOOKIE, OEVM_ALL, 0},
    {OETAG_KEST_MKTCOOKIE, OEVM_ALL, 0},  {OETAG_KEST_BID, OEVM_ALL, 0},    {OETAG_KEST_USERID, OEVM_ALL, 0},
    {OETAG_KEST_PRESENCEID, OEVM_ALL, 0}, {OETAG_COUNTRY, OEVM_NOTV1, 0}};
const OETagRow kSonRsRequired[] = {
    {OETAG_STATUS, OEVM_ALL, 0}, {OETAG_DTSERVER, OEVM_ALL, 0}, {OETAG_LANGUAGE, OEVM_ALL, 0}};
const OEFieldRow kSonRsFields[] = {
    {OETAG_STATUS, OEFK_CHILD, OE_MEMBER(OESignOnRs, m_status), nullptr, OE_MAKE(NewStatus)},
    {OETAG_DTSERVER, OEFK_DATETIME, OE_MEMBER(OESignOnRs, m_dtServer), nullptr, nullptr},
    {OETAG_USERKEY, OEFK_TEXT, OE_MEMBER(OESignOnRs, m_userKey), nullptr, nullptr},
    {OETAG_TSKEYEXPIRE, OEFK_DATETIME, OE_MEMBER(OESignOnRs, m_tsKeyExpire), nullptr, nullptr},
    {OETAG_LANGUAGE, OEFK_TEXT, OE_MEMBER(OESignOnRs, m_language), nullptr, nullptr},
    {OETAG_COUNTRY, OEFK_TEXT, OE_MEMBER(OESignOnRs, m_country), nullptr, nullptr},
    {OETAG_DTPROFUP, OEFK_DATETIME, OE_MEMBER(OESignOnRs, m_dtProfUp), nullptr, nullptr},
    {OETAG_DTACCTUP, OEFK_DATETIME, OE_MEMBER(OESignOnRs, m_dtAcctUp), nullptr, nullptr},
    {OETAG_FI, OEFK_CHILD, OE_MEMBER(OESignOnRs, m_fi), nullptr, OE_MAKE(NewFI)},
    {OETAG_SESSCOOKIE, OEFK_TEXT, OE_MEMBER(OESignOnRs, m_sessCookie), nullptr, nullptr},
    {OETAG_KEST_MKTCOOKIE, OEFK_TEXT, OE_MEMBER(OESignOnRs, m_kestMktCookie), nullptr, nullptr},
    {OETAG_KEST_BID, OEFK_ULONG, OE_MEMBER(OESignOnRs, m_kestBid), nullptr, nullptr},
    {OETAG_KEST_USERID, OEFK_TEXT, OE_MEMBER(OESignOnRs, m_kestUserId), nullptr, nullptr},
    {OETAG_KEST_PRESENCEID, OEFK_ULONG, OE_MEMBER(OESignOnRs, m_kestPresenceId), nullptr, nullptr},
};

const OETagRow kPinRqValid[] = {{OETAG_USERID, OEVM_ALL, 0}, {OETAG_NEWUSERPASS, OEVM_ALL, 0}};
const OEFieldRow kPinRqFields[] = {
    {OETAG_USERID, OEFK_TEXT, OE_MEMBER(OEPinChangeRq, m_userId), nullptr, nullptr},
    {OETAG_NEWUSERPASS, OEFK_TEXT, OE_MEMBER(OEPinChangeRq, m_newUserPass), nullptr, nullptr},
};
const OETagRow kPinRsValid[] = {{OETAG_USERID, OEVM_ALL, 0}, {OETAG_DTCHANGED, OEVM_ALL, 0}};
const OETagRow kPinRsRequired[] = {{OETAG_USERID, OEVM_ALL, 0}};
const OEFieldRow kPinRsFields[] = {
    {OETAG_USERID, OEFK_TEXT, OE_MEMBER(OEPinChangeRs, m_userId), nullptr, nullptr},
    {OETAG_DTCHANGED, OEFK_DATETIME, OE_MEMBER(OEPinChangeRs, m_dtChanged), nullptr, nullptr},
};

const OEAggregateDesc kFIDesc = OE_DESC(OETAG_FI, kFIValid, kFIRequired, kFIFields);
const OEAggregateDesc kSonRqDesc = OE_DESC(OETAG_SONRQ, kSonRqValid, kSonRqRequired, kSonRqFields);
const OEAggregateDesc kSonRsDesc = OE_DESC(OETAG_SONRS, kSonRsValid, kSonRsRequired, kSonRsFields);
const OEAggregateDesc kPinRqDesc = OE_DESC(OETAG_PINCHRQ, kPinRqValid, kPinRqValid, kPinRqFields);
const OEAggregateDesc kPinRsDesc = OE_DESC(OETAG_PINCHRS, kPinRsValid, kPinRsRequired, kPinRsFields);

const unsigned kLastDictionaryTag = 1447;

} // namespace

OEPassword::~OEPassword() {
    Clear(0);
}

OEFI::OEFI(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_FI);
}
const OEAggregateDesc& OEFI::Describe() const {
    return kFIDesc;
}

OESignOnRq::OESignOnRq(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_SONRQ);
}
const OEAggregateDesc& OESignOnRq::Describe() const {
    return kSonRqDesc;
}

OEParseStatus OESignOnRq::HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) {
    if (!entry || entry->m_id > kLastDictionaryTag) return OEPS_INVALID;
    return OEAggregate::HandleTagElement(entry, value);
}

unsigned short OESignOnRq::AllRequiredPresent() {
    if (!OEAggregate::AllRequiredPresent()) return 0;
    if (ValidateTag(OETAG_USERID) && ValidateTag(OETAG_USERPASS)) return 1;
    return ValidateTag(OETAG_USERKEY);
}

OESignOnRs::OESignOnRs(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_SONRS);
}
const OEAggregateDesc& OESignOnRs::Describe() const {
    return kSonRsDesc;
}

OEPinChangeRq::OEPinChangeRq(unsigned short version) : OETransBase(version) {
    SetType(OETAG_PINCHRQ);
}
const OEAggregateDesc& OEPinChangeRq::Describe() const {
    return kPinRqDesc;
}

OEPinChangeRs::OEPinChangeRs(unsigned short version) : OETransBase(version) {
    SetType(OETAG_PINCHRS);
}
const OEAggregateDesc& OEPinChangeRs::Describe() const {
    return kPinRsDesc;
}
