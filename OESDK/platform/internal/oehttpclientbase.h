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

// Included by the one client file of the OS being built; everything here has internal linkage, so
// that none of it (not even the classes' type information) is exported from the library.
namespace {

// The SHA-1 digest md (n bytes, at most 20 used) as upper-case hex digits into out.
void HexOf(const unsigned char* md, unsigned long n, char out[41]) {
    static const char kHex[] = "0123456789ABCDEF";
    unsigned long i = 0;
    for (; i < n && i < 20; ++i) {
        out[2 * i] = kHex[md[i] >> 4];
        out[2 * i + 1] = kHex[md[i] & 15];
    }
    out[2 * i] = '\0';
}

// A root added to one request with ICAddTrustedRoot.
struct ICRoot {
    std::vector<unsigned char> der;
    short id;
};

// One request as every client keeps it; a client derives its own with the OS's handles.
struct ICRequestBase {
    virtual ~ICRequestBase() {}
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
    virtual ~ICSessionBase() {}

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

// ---------------------------------------------------------------- implementation

// Handles are never reused within the library's life.
std::atomic<std::uintptr_t> g_nextHandle{1};

ICRequest OEHttpClientBase::ICSendDataRequest(long* result, ICSession session, const char* url,
                                              const char* body, unsigned long length, const char* tempDir,
                                              ICCompletionCallback callback, void* context) {
    ICRequestBase* r = Make(result, session, url, tempDir, callback, context, true, body, length);
    return r ? reinterpret_cast<ICRequest>(r->handle) : nullptr;
}

ICRequest OEHttpClientBase::ICGetFileRequest(long* result, ICSession session, const char* url,
                                             const char* tempDir, ICCompletionCallback callback,
                                             void* context) {
    ICRequestBase* r = Make(result, session, url, tempDir, callback, context, false, nullptr, 0);
    return r ? reinterpret_cast<ICRequest>(r->handle) : nullptr;
}

long OEHttpClientBase::ICSetSSLInfo(ICRequest request, long ignoreErrors) {
    std::shared_ptr<ICRequestBase> r = Find(request);
    if (!r) return 12018;
    r->ignoreErrors = ignoreErrors;
    return 0;
}

long OEHttpClientBase::ICSetHTTPInfo(ICRequest request, long, long post, const char* contentType,
                                     const char* extraHeaders, long noCache, long timeout) {
    std::shared_ptr<ICRequestBase> r = Find(request);
    if (!r) return 12018;
    if (post && !r->post) return 87; // a get cannot become a post here
    try {
        r->contentType = contentType ? contentType : "";
        r->extraHeaders = extraHeaders ? extraHeaders : "";
    } catch (...) {
        return 8;
    }
    r->noCache = noCache;
    r->timeout = timeout < 0 ? 0 : timeout;
    return 0;
}

long OEHttpClientBase::ICAddTrustedRoot(ICRequest request, const unsigned char* der, unsigned long length,
                                        short rootId) {
    std::shared_ptr<ICRequestBase> r = Find(request);
    if (!r) return 12018;
    if (!der || !length) return 87;
    try {
        r->roots.push_back(ICRoot{std::vector<unsigned char>(der, der + length), rootId});
    } catch (...) {
        return 8;
    }
    return 0;
}

long OEHttpClientBase::ICSetCertificateCallback(ICRequest request, ICCertificateCallback callback,
                                                void* context) {
    std::shared_ptr<ICRequestBase> r = Find(request);
    if (!r) return 12018;
    r->certCallback = callback;
    r->certContext = context;
    return 0;
}

long OEHttpClientBase::ICInitiate(ICSession session, ICRequest request, long, long) {
    std::shared_ptr<ICRequestBase> r = Find(request);
    if (!r || r->started || !session) return 12018;
    {
        std::lock_guard<std::mutex> guard(m_lock);
        TakeTrustStore(*r);
    }
    try {
        r->thread = std::thread(&OEHttpClientBase::Run, this, r);
    } catch (...) {
        return kICErrInternal;
    }
    r->started = true;
    return 0;
}

long OEHttpClientBase::ICCancel(ICSession session, ICRequest request) {
    ICSessionBase* s = static_cast<ICSessionBase*>(session);
    if (!s) return 12018;
    std::lock_guard<std::mutex> guard(s->lock);
    for (auto& r : s->requests)
        if (r->handle == reinterpret_cast<std::uintptr_t>(request)) {
            Cancel(*r);
            return 0;
        }
    return 12018;
}

void OEHttpClientBase::Cancel(ICRequestBase& r) {
    r.cancelled.store(true);
}

void OEHttpClientBase::EndSession(ICSessionBase& s) {
    {
        std::lock_guard<std::mutex> guard(s.lock);
        for (auto& r : s.requests) Cancel(*r);
    }
    for (auto& r : s.requests)
        if (r->thread.joinable()) r->thread.join();
    std::lock_guard<std::mutex> registry(m_lock);
    for (auto& r : s.requests) m_live.erase(r->handle);
}

void ICRequestBase::Finish(unsigned long code) {
    ICCallbackData d{};
    d.replyFile = replyPath.c_str();
    d.headerFile = headerPath.c_str();
    d.code = code;
    // The callback is the last thing that touches the caller: it may go on at once.
    if (callback) callback(kICStatusFinished, &d, context);
    finished.store(true);
}

ICRequestBase* OEHttpClientBase::Make(long* result, ICSession session, const char* url, const char* tempDir,
                                      ICCompletionCallback callback, void* context, bool post,
                                      const char* body, unsigned long length) {
    ICSessionBase* s = static_cast<ICSessionBase*>(session);
    if (result) *result = 0;
    if (!s || !url || !*url) {
        if (result) *result = 87;
        return nullptr;
    }
    // Out of memory (the shared pointer's block, the copies of the texts and of the body) is 8.
    std::shared_ptr<ICRequestBase> r;
    try {
        r = NewRequest(*s);
        if (r) {
            r->url = url;
            r->tempDir = tempDir ? tempDir : "";
            r->post = post;
            if (body && length) r->body.assign(body, length);
        }
    } catch (...) {
        r = nullptr;
    }
    if (!r) {
        if (result) *result = 8;
        return nullptr;
    }
    r->handle = g_nextHandle.fetch_add(1);
    r->callback = callback;
    r->context = context;
    ICRequestBase* raw = r.get();
    std::lock_guard<std::mutex> guard(s->lock);
    std::lock_guard<std::mutex> registry(m_lock);
    // Finished transfers are reaped here; handles are never reused, so a late ICCancel on a
    // reaped one finds nothing rather than another transfer.
    for (size_t i = 0; i < s->requests.size();) {
        ICRequestBase* old = s->requests[i].get();
        if (old->started && old->finished.load()) {
            old->thread.join();
            m_live.erase(old->handle);
            s->requests.erase(s->requests.begin() + static_cast<long>(i));
        } else {
            ++i;
        }
    }
    try {
        s->requests.push_back(r);
        m_live[raw->handle] = r;
    } catch (...) {
        if (!s->requests.empty() && s->requests.back() == r) s->requests.pop_back();
        if (result) *result = 8;
        return nullptr;
    }
    return raw;
}

std::shared_ptr<ICRequestBase> OEHttpClientBase::Find(ICRequest request) {
    std::lock_guard<std::mutex> guard(m_lock);
    auto it = m_live.find(reinterpret_cast<std::uintptr_t>(request));
    return it == m_live.end() ? nullptr : it->second;
}

} // namespace
} // namespace OEPlatform

#endif
