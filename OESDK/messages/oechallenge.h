// The challenge exchange of the sign-on message set: CHALLENGERQ asks the server for a nonce and
// its certificate identifier, CHALLENGERS answers with them.
#ifndef OESDK_MESSAGES_OECHALLENGE_H
#define OESDK_MESSAGES_OECHALLENGE_H
#include "messages/oetrans.h"

// What the two have in common: USERID and FICERTID.
class OE_API OEChallengeBase : public OETransBase {
public:
    explicit OEChallengeBase(unsigned short version = 0) : OETransBase(version) {}
    OE_TEXT_ACCESSORS(UserId, OETAG_USERID);
    OE_TEXT_ACCESSORS(FICertId, OETAG_FICERTID);

    OEString32 m_userId;
    OEBoundedString<64> m_fiCertId;
};

// CHALLENGERQ: USERID (required) and FICERTID.
OE_AGGREGATE_CLASS(OEChallengeRq, OEChallengeBase);

// CHALLENGERS: USERID, NONCE and FICERTID, all required.
class OE_API OEChallengeRs : public OEChallengeBase {
public:
    explicit OEChallengeRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(Nonce, OETAG_NONCE);

    OEBoundedString<16> m_nonce;
};

#endif
