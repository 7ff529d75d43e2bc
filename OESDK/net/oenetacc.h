// Transport base: OENetAccess is a transport session through which the host exchanges OFX
// files, OENetRequest one exchange on it. The base request already answers local "file:"
// addresses, so a reply can be read from disk with no network at all; LocalAccess does only
// that. The HTTPS transport (vrnacc.h) and the manual receiver exchange (recvacc.h) derive from
// these classes.
#ifndef OESDK_NET_OENETACC_H
#define OESDK_NET_OENETACC_H

#include "oeexport.h"
#include "foundation/oebuffer.h"
#include "foundation/oestring.h"

#include <cstdarg>
#include <cstddef>

// Result of every transport operation.
enum OENetStatus : unsigned int {
    OENetOK = 0,                 // success, or handled locally (a "file:" address)
    OENetOpenFailed = 1,         // ICOpenInet or ICConnect failed; receiver send refused
    OENetCannotConnect = 2,      // client error 12029
    OENetNotHandled = 3,         // the base request does not handle the address
    OENetReplySizeFailed = 5,    // no reply size to report (no reply, or the local file is missing)
    OENetReplyLoadFailed = 6,    // no reply, unreadable reply file, or a reply whose size changed
    OENetCloseFailed = 7,        // ICCloseInet failed
    OENetRequestFailed = 8,      // the client refused to create the request, or no address
    OENetInitiateFailed = 10,    // ICInitiate failed
    OENetOutOfMemory = 12,       // the reply buffer could not be allocated
    OENetHttpClientError = 14,   // HTTP 400 to 407, 409 to 415
    OENetServerUnavailable = 15, // HTTP 503, 504, or client error 12007
    OENetSSLSetupFailed = 17,    // ICSetSSLInfo failed
    OENetSecurityError = 19,     // client error 12037 or 12157
    OENetCancelFailed = 25,      // ICCancel failed
    OENetNotAvailable = 26,      // client code 0x4000002, or ICConnect returned 2200
    OENetTimeout = 27,           // HTTP 408, or client error 12002
    OENetNotImplemented = 28,    // HTTP 501 or 502
    OENetUnknownError = 29       // any other non-zero code, HTTP 500 included
};

// The name of a status ("OENetTimeout"); "OENetStatus" for a value without a name.
OE_API const char* OENetStatusName(OENetStatus status);

// What a transport reports through the session callback. The two pointers of each code:
// OEOpProgress: unsigned long* done, unsigned long* total (0 = unknown) of the current transfer.
enum OEOpCode : unsigned int { OEOpNone = 0, OEOpProgress = 1 };

// Detail levels of log lines: errors and details.
enum : unsigned short { OENetLogError = 1, OENetLogDetail = 3 };

typedef void (*OENetLogCallback)(const char* text, unsigned short level, const char* extra);
typedef void (*OENetSessionCallback)(OEOpCode op, void* first, void* second);

class OENetRequest;

class OE_API OENetAccess {
public:
    OENetAccess();
    virtual ~OENetAccess();
    OENetAccess(const OENetAccess&) = delete;
    OENetAccess& operator=(const OENetAccess&) = delete;

    virtual OENetStatus InitConnection() = 0;
    virtual OENetStatus EndConnection() = 0;
    // A request bound to this access; the caller owns it and frees it with DeleteNetRequest.
    virtual OENetRequest* NewNetRequest() = 0;
    virtual void DeleteNetRequest(OENetRequest* request);
    virtual unsigned short IsNetworkSetup() { return 1; }
    virtual unsigned short CanDoNetworkSetup() { return 0; }
    virtual unsigned short DoNetworkSetup() { return 0; }
    // The last error of the underlying client (0 = none).
    virtual unsigned short GetStatus(unsigned long* status);
    virtual void SetGlobalState(void* state);

    virtual void SetLogCallback(OENetLogCallback callback) { m_logCallback = callback; }
    virtual void SetSessionCallback(OENetSessionCallback callback) { m_sessionCallback = callback; }
    // Hands a line to the log callback (nothing when none is set).
    virtual void LogMessage(const char* text, unsigned short level, const char* extra);
    // printf-style convenience over LogMessage (the line is cut at 1023 bytes).
    void LogFormat(unsigned short level, const char* format, ...)
#if defined(__GNUC__)
        __attribute__((format(printf, 3, 4)))
#endif
        ;
    // The same over a va_list, handed to LogMessage whether or not a callback is set.
    void LogFormatV(unsigned short level, const char* format, va_list args)
#if defined(__GNUC__)
        __attribute__((format(printf, 3, 0)))
#endif
        ;
    virtual void UpdateSessionStatus(OEOpCode op, void* first, void* second);
    // Progress of a transfer: UpdateSessionStatus(OEOpProgress, &done, &total).
    virtual void Progress(unsigned long done, unsigned long total);

    virtual void SetAgentName(const OEString& name) {
        m_agentName = name;
    }
    virtual void SetTempFilePath(const OEString& path) {
        m_tempFilePath = path;
    }

protected:
    OEString GetAgentName() const {
        return m_agentName;
    }
    OEString GetTempFilePath() const {
        return m_tempFilePath;
    }

    friend class OENetRequest;

private:
    OENetLogCallback m_logCallback;
    OENetSessionCallback m_sessionCallback;
    OEString m_agentName;
    OEString m_tempFilePath;
};

class OE_API OENetRequest {
public:
    OENetRequest();
    virtual ~OENetRequest();
    OENetRequest(const OENetRequest&) = delete;
    OENetRequest& operator=(const OENetRequest&) = delete;

    // A "file:" address is kept and answered from disk (0); anything else is left to a
    // subclass (3).
    virtual OENetStatus Get(const OEString& url);
    // The base sends nowhere: for a "file:" address the reply is read from that file, as Get.
    virtual OENetStatus Send(const OEString& url, OEBuffer* body);
    virtual OENetStatus SendPlusHeaders(const OEString& url, OEBuffer* body, const char* headers);
    virtual OENetStatus SendPlusHeadersContent(const OEString& url, OEBuffer* body, const char* headers,
                                               const char* contentType);
    // Local file: 0, or 6 when it cannot be opened, 12 when the buffer cannot grow. Else 6.
    virtual OENetStatus LoadReply(OEBuffer* buffer);
    // Local file: its size and 0, or 5 when it cannot be opened. Else 5.
    virtual OENetStatus GetReplySize(unsigned long* size);
    virtual unsigned short GetHeader(const OEString& name, OEString& value);
    virtual OENetStatus Abort();
    virtual unsigned short GetStatus(unsigned long* code, unsigned long* httpStatus);
    virtual void SetTimeout(long seconds);
    virtual void SetSSLVerifyCert(unsigned short verify);
    virtual void SetSaveHeaders(unsigned short save);

    // Trust roots and pins; the base accepts none (0).
    virtual unsigned short AddTrustedRoot(const unsigned char* der, unsigned short length, short rootId);
    virtual unsigned short AddTrustedRootBER(const unsigned char* ber, unsigned short length, short rootId);
    virtual unsigned short AddExpectedSSLCertID(const unsigned char* id, unsigned short length);
    virtual unsigned short AddExpectedSSLCertName(const OEString& name);

    // The built-in roots: the private branding root (id 1000) and the two public server roots
    // (ids 2000 and 4000), added with AddTrustedRoot. The library carries no certificate bytes
    // of its own (the historical roots of these roles have expired): the host registers the
    // certificate of each role once with SetBuiltInRoot. An adder returns 0 when no certificate
    // is registered for its role or the request takes no roots, else AddTrustedRoot's result.
    virtual unsigned short AddKestivBrandingRoot();
    virtual unsigned short AddVeriSignOFXCARoot();
    virtual unsigned short AddRSAServerRoot();
    // Registers (copies) the DER certificate of a role: rootId 1000, 2000 or 4000. Null or 0
    // bytes remove it. Returns 1, or 0 for another id or when memory is short. Not thread-safe:
    // call at start-up.
    static unsigned short SetBuiltInRoot(short rootId, const unsigned char* der, unsigned short length);

    // 1 when the first five characters are "file:" in any case.
    static unsigned short HasFileScheme(const char* url);
    // The local file name a "file:" address names, into out (size bytes). The path starts after
    // "file:/", or after "file://" (so one, two or three slashes work); a drive after a third
    // slash ("file:///C|/dir/x") is taken as the start of the path. On Windows each "/" becomes
    // "\" and each "|" becomes ":" ("C:\dir\x"). On POSIX "/" stays and a drive prefix ("C|" or
    // "C:") is dropped, so "file:///C|/dir/x" and "file:///dir/x" both name "/dir/x".
    // Returns 1, or 0 (and an empty out) when the scheme is not "file:" or out is too small.
    static unsigned short ConvertFileURLToLocalFileName(char* out, std::size_t size, const char* url);
    // The reverse: "C:\dir\x" gives "file:///C|/dir/x", "/dir/x" gives "file:///dir/x", a
    // relative name gives "file:/name". Returns 1, or 0 when out is too small.
    static unsigned short ConvertLocalFileNameToFileURL(char* out, std::size_t size, const char* path);

    const OEString& GetURL() const { return m_url; }

protected:
    // Appends a whole file to a buffer in blocks of 10000 bytes until a block comes back short (or
    // the buffer cannot grow). false when the file cannot be opened.
    static bool AppendFileInBlocks(const char* path, OEBuffer* buffer);

    OEString m_url;
};

// Access that answers only "file:" addresses.
class OE_API LocalAccess : public OENetAccess {
public:
    OENetStatus InitConnection() override { return OENetOK; }
    OENetStatus EndConnection() override { return OENetOK; }
    OENetRequest* NewNetRequest() override;
};

#endif
