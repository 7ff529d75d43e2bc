// Internal to the platform layer (not installed): what the built-in HTTP clients of every OS keep
// alike. The base keeps the registry of requests (handles never reused, finished transfers reaped
// when the next request is made), takes the request's settings (ICSetSSLInfo, ICSetHTTPInfo,
// ICAddTrustedRoot, ICSetCertificateCallback), starts and cancels transfers, and ends them with
// the one completion callback. A client of one OS adds its own session and request members and
// the transfer itself. Running out of memory answers 8, as the Windows error of that name; no
// exception leaves an IC... operation.
#ifndef OESDK_PLATFORM_INTERNAL_OEHTTPCLIENTBASE_H
#define OESDK_PLATFORM_INTERNAL_OEHTTPCLIENTBASE_H

#include "platform/oehttpclient.h"

#include <atomic>
#include <cstdint>
#include <map>
#include <memory>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

namespace OEPlatform {

// The SHA-1 digest md (n bytes, at most 20 used) as upper-case hex digits into out.
void HexOf(const unsigned char* md, unsigned long n, char out[41]);

// A root added to one request with ICAddTrustedRoot.
struct ICRoot {
    std::vector<unsigned char> der;
    short id;
};

// One request as every client keeps it; a client derives its own with the OS's handles.
struct ICRequestBase {
    virtual ~ICRequestBase();
    // The completion callback with the two files and the code; the request is finished after it.
    void Finish(unsigned long code);

    std::uintptr_t handle = 0;
    bool post = false;
    std::string url, body, tempDir;
    ICCompletionCallback callback = nullptr;
    void* context = nullptr;
    long ignoreErrors = 0;
    std::string contentType, extraHeaders;
    long noCache = 0;
    long timeout = 0;
    std::vector<ICRoot> roots;
    ICCertificateCallback certCallback = nullptr;
    void* certContext = nullptr;
    std::thread thread; // runs the transfer from ICInitiate on
    bool started = false;
    std::atomic<bool> cancelled{false};
    std::atomic<bool> finished{false}; // set after the completion callback returned
    std::string replyPath, headerPath;
};

// A session: its requests, under its lock. A client derives its own with the OS's handles.
struct ICSessionBase {
    virtual ~ICSessionBase();

    std::mutex lock;
    std::vector<std::shared_ptr<ICRequestBase>> requests;
};

class OEHttpClientBase : public OEHttpClient {
public:
    ICRequest ICSendDataRequest(long* result, ICSession session, const char* url, const char* body,
                                unsigned long length, const char* tempDir, ICCompletionCallback callback,
                                void* context) override;
    ICRequest ICGetFileRequest(long* result, ICSession session, const char* url, const char* tempDir,
                               ICCompletionCallback callback, void* context) override;
    long ICSetSSLInfo(ICRequest request, long ignoreErrors) override;
    long ICSetHTTPInfo(ICRequest request, long reserved, long post, const char* contentType,
                       const char* extraHeaders, long noCache, long timeout) override;
    long ICAddTrustedRoot(ICRequest request, const unsigned char* der, unsigned long length,
                          short rootId) override;
    long ICSetCertificateCallback(ICRequest request, ICCertificateCallback callback, void* context) override;
    long ICInitiate(ICSession session, ICRequest request, long reserved1, long reserved2) override;
    long ICCancel(ICSession session, ICRequest request) override;

protected:
    // A new request of this client for session s, with what it takes from the session; null when
    // out of memory. The base fills in the rest.
    virtual std::shared_ptr<ICRequestBase> NewRequest(ICSessionBase& s) = 0;
    // Hands the client's trust store to a request about to start (m_lock is held).
    virtual void TakeTrustStore(ICRequestBase& r) = 0;
    // The transfer, on the request's own thread; it ends with Finish.
    virtual void Run(std::shared_ptr<ICRequestBase> r) = 0;
    // Marks a request cancelled; a client whose calls block overrides it to interrupt them.
    virtual void Cancel(ICRequestBase& r);

    // Cancels every request of a session, waits for their threads and forgets them: the part of
    // ICCloseInet before the session itself goes.
    void EndSession(ICSessionBase& s);

    std::mutex m_lock; // guards m_live and the derived client's trust store

private:
    // A registered request of a session: *result 0, or 87 for a bad argument, 8 out of memory.
    ICRequestBase* Make(long* result, ICSession session, const char* url, const char* tempDir,
                        ICCompletionCallback callback, void* context, bool post, const char* body,
                        unsigned long length);
    std::shared_ptr<ICRequestBase> Find(ICRequest request);

    std::map<std::uintptr_t, std::shared_ptr<ICRequestBase>> m_live;
};

} // namespace OEPlatform

#endif
