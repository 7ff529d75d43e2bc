// Manual, file-based transport: a send writes the request to "SEND.DAT", asks the user to carry
// it to the other side and to put the answer into "RECV.DAT", and then reads that file as the
// reply. It serves for offline exchange and for trying requests and responses by hand.
#ifndef OESDK_NET_RECVACC_H
#define OESDK_NET_RECVACC_H

#include "oeexport.h"
#include "net/oenetacc.h"

#include <cstdint>

class ReceiverAccess;

class OE_API ReceiverRequest : public OENetRequest {
public:
    ReceiverRequest();
    ~ReceiverRequest() override;

    void SetAccess(ReceiverAccess* access) { m_access = access; }

    // Writes the body to SEND.DAT and asks the user; yes: the result of Get, no (or SEND.DAT
    // cannot be written): 1.
    OENetStatus Send(const OEString& url, OEBuffer* body) override;
    // Notes where RECV.DAT is and its size; always 0 (a missing file shows as reply size 0).
    OENetStatus Get(const OEString& url) override;
    // Appends RECV.DAT (which stays) to the buffer: 0, or 6 when there is none, it cannot be
    // read or its size changed since Get.
    OENetStatus LoadReply(OEBuffer* buffer) override;
    OENetStatus GetReplySize(unsigned long* size) override;

    // Certificates mean nothing here: accepted and ignored (1).
    unsigned short AddTrustedRoot(const unsigned char*, unsigned short, short) override { return 1; }
    unsigned short AddTrustedRootBER(const unsigned char*, unsigned short, short) override { return 1; }
    unsigned short AddExpectedSSLCertID(const unsigned char*, unsigned short) override { return 1; }
    unsigned short AddExpectedSSLCertName(const OEString&) override { return 1; }

    // The texts of the question asked after SEND.DAT is written, in order.
    static const char* const kPrompt[4];

protected:
    // Turns a bare file name into the path to use (out holds 1024 bytes). The base keeps the
    // name, so the files are in the current directory; a host puts them in its data folder.
    virtual void BuildFileSpec(const char* name, char* out);
    // Shows the text as a yes/no question; non-zero for yes. The base has no user to ask and
    // answers no: a host supplies the dialog.
    virtual int RRYesNoMsg(const char* text);

    ReceiverAccess* m_access;
    char m_replyFile[1024];
    std::uint32_t m_replySize;
    OEBuffer* m_body; // not owned
};

class OE_API ReceiverAccess : public LocalAccess {
public:
    OENetRequest* NewNetRequest() override;
};

#endif
