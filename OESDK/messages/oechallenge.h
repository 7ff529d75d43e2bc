// The challenge exchange of the sign-on message set: CHALLENGERQ asks the server for a nonce and
// its certificate identifier, CHALLENGERS answers with them.
#ifndef OESDK_MESSAGES_OECHALLENGE_H
#define OESDK_MESSAGES_OECHALLENGE_H
#include "messages/oetrans.h"

// What the two have in common: USERID and FICERTID.
class OE_API OEChallengeBase : public OETransBase {
public:
    explicit OEChallengeBase(unsigned short version = 0) : OETransBase(version) {}
    const OEString* GetUserId() const { return GetText(OETAG_USERID); }
    unsigned short SetUserId(const OEString& v) { return SetFromText(OETAG_USERID, v); }
    const OEString* GetFICertId() const { return GetText(OETAG_FICERTID); }
    unsigned short SetFICertId(const OEString& v) { return SetFromText(OETAG_FICERTID, v); }

    OEString32 m_userId;
    OEBoundedString<64> m_fiCertId;
};

// CHALLENGERQ: USERID (required) and FICERTID.
class OE_API OEChallengeRq : public OEChallengeBase {
public:
    explicit OEChallengeRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
};

// CHALLENGERS: USERID, NONCE and FICERTID, all required.
class OE_API OEChallengeRs : public OEChallengeBase {
public:
    explicit OEChallengeRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    const OEString* GetNonce() const { return GetText(OETAG_NONCE); }
    unsigned short SetNonce(const OEString& v) { return SetFromText(OETAG_NONCE, v); }

    OEBoundedString<16> m_nonce;
};

#endif
