#include "messages/oechallenge.h"

namespace {

const OETagRow kRqValid[] = {{OETAG_USERID, OEVM_ALL, 0}, {OETAG_FICERTID, OEVM_ALL, 0}};
const OETagRow kRqRequired[] = {{OETAG_USERID, OEVM_ALL, 0}};
const OEFieldRow kRqFields[] = {
    {OETAG_USERID, OEFK_TEXT, OE_MEMBER(OEChallengeRq, m_userId), nullptr, nullptr},
    {OETAG_FICERTID, OEFK_TEXT, OE_MEMBER(OEChallengeRq, m_fiCertId), nullptr, nullptr},
};

const OETagRow kRsValid[] = {
    {OETAG_USERID, OEVM_ALL, 0}, {OETAG_NONCE, OEVM_ALL, 0}, {OETAG_FICERTID, OEVM_ALL, 0}};
const OEFieldRow kRsFields[] = {
    {OETAG_USERID, OEFK_TEXT, OE_MEMBER(OEChallengeRs, m_userId), nullptr, nullptr},
    {OETAG_NONCE, OEFK_TEXT, OE_MEMBER(OEChallengeRs, m_nonce), nullptr, nullptr},
    {OETAG_FICERTID, OEFK_TEXT, OE_MEMBER(OEChallengeRs, m_fiCertId), nullptr, nullptr},
};

const OEAggregateDesc kRqDesc = OE_DESC(OETAG_CHALLENGERQ, kRqValid, kRqRequired, kRqFields);
// Every element of the response is required: the valid rows serve as the required ones.
const OEAggregateDesc kRsDesc = OE_DESC(OETAG_CHALLENGERS, kRsValid, kRsValid, kRsFields);

} // namespace

OEChallengeRq::OEChallengeRq(unsigned short version) : OEChallengeBase(version) {
    SetType(OETAG_CHALLENGERQ);
}
const OEAggregateDesc& OEChallengeRq::Describe() const {
    return kRqDesc;
}

OEChallengeRs::OEChallengeRs(unsigned short version) : OEChallengeBase(version) {
    SetType(OETAG_CHALLENGERS);
}
const OEAggregateDesc& OEChallengeRs::Describe() const {
    return kRsDesc;
}
