// The host's HTTP client: the IC... operations through which the transport (net/vrnacc) carries
// a request over HTTP or HTTPS, and the certificate object used to name and pin trust roots.
//
// The client is an interface: a host that has its own HTTP stack derives from OEHttpClient and
// installs it with OEHttpClient::SetCurrent. OESDK ships a real default on each OS: libcurl with
// OpenSSL on POSIX (oehttpclient_posix.cpp) and WinHTTP with CryptoAPI on Windows
// (oehttpclient_win.cpp).
//
// Contract of the default clients:
// - A transfer runs on a background thread from ICInitiate on and ends with exactly one
//   completion callback (status 1). The reply body and the reply headers are left in two
//   temporary files in the directory given to ICSendDataRequest / ICGetFileRequest (the system's
//   temporary directory when it is empty); the caller reads and deletes them.
// - HTTPS is verified by default: chain to a trust anchor, validity dates, host name. The anchors
//   are the system's roots, the roots of ICSetTrustStoreFile and the roots added to the request
//   with ICAddTrustedRoot. After the handshake and before any byte of the request (which carries
//   the user's credentials) is sent, the certificate callback sees the verified chain and the id
//   of the root that anchors it; a non-zero answer aborts the transfer before the request goes
//   out, and that answer becomes the completion code.
// - Completion codes: 0 success; 0x0403nnnn an HTTP status nnnn other than 2xx;
//   0x0401nnnn a network error nnnn in the 12000 range (kICErr... below); other values come from
//   the certificate callback.
#ifndef OESDK_PLATFORM_OEHTTPCLIENT_H
#define OESDK_PLATFORM_OEHTTPCLIENT_H

#include "oeexport.h"

#include <cstddef>

typedef void* ICSession;
typedef void* ICRequest;

// High halves of client completion codes.
enum : unsigned long {
    kICNetworkErrorBase = 0x04010000ul, // low half: kICErr... network error
    kICHttpStatusBase = 0x04030000ul,   // low half: HTTP status
    kICNotAvailable = 0x4000002ul       // no network available at all
};

// Network errors (low half of 0x0401nnnn codes), numbered as the Windows Internet API does.
enum : unsigned long {
    kICErrTimeout = 12002,
    kICErrNameNotResolved = 12007,
    kICErrOperationCancelled = 12017,
    kICErrCannotConnect = 12029,
    kICErrConnectionAborted = 12030,
    kICErrConnectionReset = 12031,
    kICErrCertDateInvalid = 12037,
    kICErrInvalidCA = 12045,
    kICErrSecureFailure = 12157,
    kICErrInternal = 12004
};

// kind and values of a callback. Progress (status 0): value[0] is the kind (1 connecting,
// 2 sending: value[2] bytes sent of value[4]; 3 receiving: value[1] bytes received of value[3],
// which is 0 when the server did not announce a length). Completion (status 1): the two file
// paths and the code.
struct ICCallbackData {
    unsigned long value[5];
    const char* replyFile;
    const char* headerFile;
    unsigned long code;
};
enum : unsigned long { kICStatusProgress = 0, kICStatusFinished = 1 };
enum : unsigned long { kICProgressConnecting = 1, kICProgressSending = 2, kICProgressReceiving = 3 };

typedef void (*ICCompletionCallback)(unsigned long status, const ICCallbackData* data, void* context);

// One certificate of a chain, in DER form.
struct ICCertificate {
    const unsigned char* der;
    unsigned long length;
};
// The chain the client verified: chain[0] is the anchoring root, chain[count - 1] the server's
// own certificate. rootId is the id given with ICAddTrustedRoot to the root that anchors the
// chain, 0 when it is anchored elsewhere (the system's roots, the trust store file). error is a
// verification fault that a client reports here instead of failing the handshake itself (the
// default clients fail the handshake, so they pass 0). Returns 0 to go on, else the rejection
// code.
typedef long (*ICCertificateCallback)(const ICCertificate* chain, unsigned long count, short rootId,
                                      long error, void* context, long reserved1, long reserved2);

class OE_API OEHttpClient {
public:
    virtual ~OEHttpClient();

    // Non-zero when the machine has no usable network set up.
    virtual long ICNeedsInternetSetup() = 0;
    // Opens a session. Null (and *error non-zero) on failure.
    virtual ICSession ICOpenInet(long* error, const char* agentName) = 0;
    // Makes sure a connection to the network exists (reserved must be 0): 0, 2200 when none is
    // available, else an error.
    virtual long ICConnect(long reserved) = 0;
    virtual long ICCloseInet(ICSession session) = 0;

    // Creates a POST of `length` bytes of `body` (copied) to url. *result non-zero on failure.
    virtual ICRequest ICSendDataRequest(long* result, ICSession session, const char* url, const char* body,
                                        unsigned long length, const char* tempDir,
                                        ICCompletionCallback callback, void* context) = 0;
    // Creates a GET of url.
    virtual ICRequest ICGetFileRequest(long* result, ICSession session, const char* url, const char* tempDir,
                                       ICCompletionCallback callback, void* context) = 0;
    // ignoreErrors 1: no certificate verification at all (for a host's own test servers).
    virtual long ICSetSSLInfo(ICRequest request, long ignoreErrors) = 0;
    // reserved must be 0; post 1 for a send, 0 for a get; contentType and extraHeaders
    // (CRLF-separated "Name: value" lines) may be null; noCache 1 asks caches not to answer;
    // timeout in seconds for the whole transfer (0 = the client's default).
    virtual long ICSetHTTPInfo(ICRequest request, long reserved, long post, const char* contentType,
                               const char* extraHeaders, long noCache, long timeout) = 0;
    // Adds a root that may anchor the server's chain, with its id (DER bytes, copied).
    virtual long ICAddTrustedRoot(ICRequest request, const unsigned char* der, unsigned long length,
                                  short rootId) = 0;
    virtual long ICSetCertificateCallback(ICRequest request, ICCertificateCallback callback,
                                          void* context) = 0;
    // Starts the transfer in the background; the completion callback ends it.
    virtual long ICInitiate(ICSession session, ICRequest request, long reserved1, long reserved2) = 0;
    // Cancels a running transfer (it then completes with 0x0401 + kICErrOperationCancelled).
    // A request that already finished is no error.
    virtual long ICCancel(ICSession session, ICRequest request) = 0;

    // Adds the PEM roots of a file to the client's own anchors for every later request (beside
    // the system's roots); null removes them. 0 on success.
    virtual long ICSetTrustStoreFile(const char* pemFile);

    // The client the transport uses: the host's when one was installed, else the built-in one.
    static OEHttpClient* GetCurrent();
    // Installs a host client (null: back to the built-in one); returns the previous host client.
    // The host keeps ownership and keeps it alive while requests run.
    static OEHttpClient* SetCurrent(OEHttpClient* client);
    // The built-in client of this OS.
    static OEHttpClient* GetDefault();
};

// An X.509 certificate: parsed from DER or BER, with a 16-bit root id and an id text (the
// SHA-1 fingerprint of its DER encoding as 40 upper-case hex digits, the same as
// `openssl x509 -fingerprint -sha1` without colons).
class OE_API OECertificate {
public:
    OECertificate();
    ~OECertificate();
    OECertificate(const OECertificate&) = delete;
    OECertificate& operator=(const OECertificate&) = delete;

    // DER: exactly one definite-length certificate, no trailing bytes. Returns 1, or 0 when the
    // bytes are no certificate (the object is then empty).
    unsigned short ParseDER(const unsigned char* bytes, unsigned long length);
    // BER: as DER, but indefinite lengths are accepted.
    unsigned short ParseBER(const unsigned char* bytes, unsigned long length);

    unsigned short IsValid() const { return m_der != nullptr ? 1 : 0; }
    void SetID(short id) { m_id = id; }
    short GetID() const { return m_id; }
    // The certificate's id text into out (at least 41 bytes). Returns 1, or 0 when empty.
    unsigned short GetCertID(char* out, std::size_t size) const;
    // The certificate's DER encoding (null when empty).
    const unsigned char* GetDER() const { return m_der; }
    unsigned long GetDERLength() const { return m_derLength; }

    // Normalises an id text for comparison: drops ':' and ' ', upper-cases. Returns the length.
    static std::size_t NormalizeID(const char* in, std::size_t length, char* out, std::size_t size);

private:
    unsigned short Parse(const unsigned char* bytes, unsigned long length, bool strictDER);
    void Reset();

    unsigned char* m_der;
    unsigned long m_derLength;
    short m_id;
    char m_sha1[41];
};

namespace OEPlatform {
// Platform pieces of the certificate object (oehttpclient_posix.cpp / oehttpclient_win.cpp):
// decodes a certificate (BER tolerated) and gives back its DER encoding (allocated with
// OEMemory::Malloc) and the SHA-1 fingerprint text. Returns 1 or 0.
int DecodeCertificate(const unsigned char* bytes, unsigned long length, unsigned char** der,
                      unsigned long* derLength, char sha1Hex[41]);
// The temporary directory for a host module (null: the running program): a folder named after
// the module's file beside the system's temporary files, made when missing; the system's
// temporary directory itself when that fails. Returns 1, or 0 when out is too small.
OE_API int TempDirForModule(void* moduleInstance, char* out, std::size_t size);
} // namespace OEPlatform

#endif
