// HTTP(S) transport: VRNNetAccess holds a session of the host's HTTP client (OEHttpClient,
// platform/oehttpclient.h); VRNNetRequest performs one send or get on it. A request hands the
// body to the client, waits for completion while keeping the calling thread's window messages
// flowing, checks the server's certificate chain before the request goes out, maps the client's
// completion code to an OENetStatus and an HTTP status, and loads the reply, which the client
// leaves in a temporary file.
#ifndef OESDK_NET_VRNACC_H
#define OESDK_NET_VRNACC_H

#include "oeexport.h"
#include "foundation/oedynarr.h"
#include "net/oenetacc.h"
#include "platform/oehttpclient.h"

#include <atomic>
#include <cstdint>

struct VRNTicket;

// One expected certificate id: its bytes as given.
struct VRNExpectedID {
    OEBuffer bytes{0, 64};
};

class OE_API VRNNetAccess : public OENetAccess {
public:
    VRNNetAccess();
    ~VRNNetAccess() override;

    OENetStatus InitConnection() override { return OENetOK; }
    // Opens the client session when needed and connects (before each exchange): 0, 1 when
    // ICOpenInet or ICConnect failed, 26 when ICConnect finds no network (2200).
    virtual OENetStatus OpenInternetIfNeeded();
    // Closes the session unless the host owns it: 0, or 7 when ICCloseInet failed.
    OENetStatus EndConnection() override;
    OENetRequest* NewNetRequest() override;
    unsigned short IsNetworkSetup() override;
    unsigned short GetStatus(unsigned long* status) override;
    // A non-null state is the host's own open client session: it is used and never opened or
    // closed here. Null gives the session back to this access.
    void SetGlobalState(void* state) override;

    // The temporary directory of a host module: the folder "oesdk-tmp" beside it, falling back
    // to the system's temporary directory (a null module means the running program).
    static void SetupTempPathFromHInst(void* moduleInstance, OEString& out);

    ICSession GetSession() const { return m_session; }
    OEHttpClient* GetClient() const { return OEHttpClient::GetCurrent(); }

protected:
    friend class VRNNetRequest;

    ICSession m_session;
    unsigned short m_externalSession;
    unsigned short m_connected;
    std::uint32_t m_lastError;
};

class OE_API VRNNetRequest : public OENetRequest {
public:
    explicit VRNNetRequest(VRNNetAccess* access);
    ~VRNNetRequest() override;

    OENetStatus Send(const OEString& url, OEBuffer* body) override;
    OENetStatus SendPlusHeaders(const OEString& url, OEBuffer* body, const char* headers) override;
    OENetStatus SendPlusHeadersContent(const OEString& url, OEBuffer* body, const char* headers,
                                       const char* contentType) override;
    // A "file:" address is answered from disk; anything else is a GET through the client.
    OENetStatus Get(const OEString& url) override;
    // The reply the client left in its file (which is then removed): 0, or 6 when there is
    // none or its size is not the one reported.
    OENetStatus LoadReply(OEBuffer* buffer) override;
    OENetStatus GetReplySize(unsigned long* size) override;
    // A reply header by name (case-insensitive) from the saved headers. 1 when found.
    unsigned short GetHeader(const OEString& name, OEString& value) override;
    OENetStatus Abort() override;
    unsigned short GetStatus(unsigned long* code, unsigned long* httpStatus) override;
    unsigned long GetReceiveError() const { return m_completionCode; }
    void SetTimeout(long seconds) override { m_timeout = static_cast<std::int32_t>(seconds); }
    void SetSSLVerifyCert(unsigned short verify) override { m_verifyCert = verify; }
    void SetSaveHeaders(unsigned short save) override { m_saveHeaders = save; }
    unsigned short AddTrustedRoot(const unsigned char* der, unsigned short length, short rootId) override;
    unsigned short AddTrustedRootBER(const unsigned char* ber, unsigned short length, short rootId) override;
    // An expected certificate id: the id text of the server's certificate (40 hex digits, case
    // and ':' separators ignored). Both return 1, or 0 when memory is short.
    unsigned short AddExpectedSSLCertID(const unsigned char* id, unsigned short length) override;
    unsigned short AddExpectedSSLCertName(const OEString& name) override;
    // 1 when a name was added that equals this one without regard to case.
    unsigned short IsAnExpectedSSLCertName(const OEString& name) const;

    // The saved reply headers (SetSaveHeaders(1)).
    OEBuffer& GetReplyHeaders() { return m_replyHeaders; }
    unsigned long GetHttpStatus() const { return m_httpStatus; }

    // Client completion code to HTTP status and to OENetStatus.
    static unsigned long MapHttpStatus(unsigned long code);
    static OENetStatus MapNetStatus(unsigned long code);
    // Log name of a root id's group.
    static const char* RootGroupName(short rootId);

    // The client's callbacks; their context is the request's ticket (see vrnacc.cpp), so a late
    // callback after the request is gone is harmless.
    static void CompletionCallback(unsigned long status, const ICCallbackData* data, void* context);
    static long VRNSSLCertificateCallback(const ICCertificate* chain, unsigned long count, short rootId,
                                          long error, void* context, long reserved1, long reserved2);
    // Progress (status 0) goes to the access's Progress; completion (status 1) takes the reply
    // and header files, the reply size and the code, and ends the wait.
    void DoCallback(unsigned long status, const ICCallbackData* data);
    // The certificate rules: a client error is returned as it is; root group 3000 gives 1671;
    // with trusted roots added the root id must be one of theirs (else 1670); the last (the
    // server's) certificate must parse (else 1670) and match an expected id if any were added
    // (else 1673). 0 accepts.
    long CheckCertificate(const ICCertificate* chain, unsigned long count, short rootId, long error);

protected:
    // Hands every trusted root to the client for this request.
    void AddAllTrustedRoots(ICRequest request);
    void Wait();
    unsigned short AppendRoot(const unsigned char* bytes, unsigned short length, short rootId, bool ber);
    // Makes the client request of a send or a get and carries it through Transfer.
    OENetStatus Begin(bool post, OEBuffer* body, const char* contentType, const char* headers);
    // Steps shared by send and get once the client request exists.
    OENetStatus Transfer(bool post, const char* contentType, const char* headers);
    void Log(unsigned short level, const char* format, ...)
#if defined(__GNUC__)
        __attribute__((format(printf, 3, 4)))
#endif
        ;

    // Ends the link to the running transfer's callbacks (they then only clean up after it).
    void ReleaseTicket();
    bool NewTicket();

    VRNNetAccess* m_access;
    VRNTicket* m_ticket;  // what the client's callbacks reach this request through
    ICRequest m_transfer; // the last transfer started (kept after the send ends)
    char m_replyFile[1024];
    char m_headerFile[1024];
    std::atomic<std::uint32_t> m_done;
    std::uint32_t m_completionCode;
    std::uint32_t m_replySize;
    std::int32_t m_timeout;
    unsigned short m_verifyCert;
    ICRequest m_request;
    OEPtrArray<OECertificate> m_trustedRoots;
    OEPtrArray<VRNExpectedID> m_expectedIDs;
    OEDynamicArrayString m_expectedNames;
    OEBuffer m_replyHeaders;
    unsigned short m_saveHeaders;
    std::uint32_t m_httpStatus;
};

#endif
