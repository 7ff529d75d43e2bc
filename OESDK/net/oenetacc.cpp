// Transport base, "file:" addresses and LocalAccess.
#include "net/oenetacc.h"

#include "foundation/oememory.h"
#include "platform/oeplatform.h"

#include <cstdarg>
#include <cstdio>
#include <cstring>

namespace {
const char kModule[] = "oenetacc";

// Registered certificates of the built-in root roles (index 0: 1000, 1: 2000, 2: 4000).
struct BuiltInRoot {
    unsigned char* der;
    unsigned short length;
};
BuiltInRoot g_builtIn[3] = {{nullptr, 0}, {nullptr, 0}, {nullptr, 0}};

int RoleIndex(short rootId) {
    switch (rootId) {
    case 1000:
        return 0;
    case 2000:
        return 1;
    case 4000:
        return 2;
    default:
        return -1;
    }
}

// Length of an open file by seeking to its end; -1 when it cannot be told.
long FileLength(std::FILE* f) {
    if (std::fseek(f, 0, SEEK_END) != 0) return -1;
    long n = std::ftell(f);
    if (std::fseek(f, 0, SEEK_SET) != 0) return -1;
    return n;
}

bool IsDrive(const char* p) {
    return ((p[0] >= 'A' && p[0] <= 'Z') || (p[0] >= 'a' && p[0] <= 'z')) && (p[1] == '|' || p[1] == ':');
}
} // namespace

const char* OENetStatusName(OENetStatus status) {
    switch (status) {
    case OENetOK:
        return "OENetOK";
    case OENetOpenFailed:
        return "OENetOpenFailed";
    case OENetCannotConnect:
        return "OENetCannotConnect";
    case OENetNotHandled:
        return "OENetNotHandled";
    case OENetReplySizeFailed:
        return "OENetReplySizeFailed";
    case OENetReplyLoadFailed:
        return "OENetReplyLoadFailed";
    case OENetCloseFailed:
        return "OENetCloseFailed";
    case OENetRequestFailed:
        return "OENetRequestFailed";
    case OENetInitiateFailed:
        return "OENetInitiateFailed";
    case OENetOutOfMemory:
        return "OENetOutOfMemory";
    case OENetHttpClientError:
        return "OENetHttpClientError";
    case OENetServerUnavailable:
        return "OENetServerUnavailable";
    case OENetSSLSetupFailed:
        return "OENetSSLSetupFailed";
    case OENetSecurityError:
        return "OENetSecurityError";
    case OENetCancelFailed:
        return "OENetCancelFailed";
    case OENetNotAvailable:
        return "OENetNotAvailable";
    case OENetTimeout:
        return "OENetTimeout";
    case OENetNotImplemented:
        return "OENetNotImplemented";
    case OENetUnknownError:
        return "OENetUnknownError";
    }
    return "OENetStatus";
}

// ---- OENetAccess ----------------------------------------------------------------------------

OENetAccess::OENetAccess()
    : m_logCallback(nullptr), m_sessionCallback(nullptr), m_agentName("NONAME"), m_tempFilePath() {}

OENetAccess::~OENetAccess() {}

void OENetAccess::DeleteNetRequest(OENetRequest* request) {
    delete request;
}

unsigned short OENetAccess::GetStatus(unsigned long* status) {
    if (status) *status = 0;
    return 1;
}

void OENetAccess::SetGlobalState(void*) {}

void OENetAccess::LogMessage(const char* text, unsigned short level, const char* extra) {
    if (m_logCallback) m_logCallback(text ? text : "", level, extra ? extra : "");
}

void OENetAccess::LogFormat(unsigned short level, const char* format, ...) {
    if (!m_logCallback) return;
    va_list args;
    va_start(args, format);
    LogFormatV(level, format, args);
    va_end(args);
}

void OENetAccess::LogFormatV(unsigned short level, const char* format, va_list args) {
    char line[1024];
    std::vsnprintf(line, sizeof line, format, args);
    LogMessage(line, level, "");
}

void OENetAccess::UpdateSessionStatus(OEOpCode op, void* first, void* second) {
    if (m_sessionCallback) m_sessionCallback(op, first, second);
}

void OENetAccess::Progress(unsigned long done, unsigned long total) {
    UpdateSessionStatus(OEOpProgress, &done, &total);
}

OENetRequest* LocalAccess::NewNetRequest() {
    return OEMemory::New<OENetRequest>();
}

// ---- OENetRequest ---------------------------------------------------------------------------

OENetRequest::OENetRequest() : m_url() {}

OENetRequest::~OENetRequest() {}

OENetStatus OENetRequest::Get(const OEString& url) {
    if (!HasFileScheme(url.c_str())) return OENetNotHandled;
    m_url = url;
    return OENetOK;
}

OENetStatus OENetRequest::Send(const OEString& url, OEBuffer* body) {
    return SendPlusHeadersContent(url, body, nullptr, nullptr);
}

OENetStatus OENetRequest::SendPlusHeaders(const OEString& url, OEBuffer* body, const char* headers) {
    return SendPlusHeadersContent(url, body, headers, nullptr);
}

// Sending to a "file:" address reads the reply from that file: the request itself goes nowhere.
OENetStatus OENetRequest::SendPlusHeadersContent(const OEString& url, OEBuffer*, const char*, const char*) {
    return Get(url);
}

OENetStatus OENetRequest::GetReplySize(unsigned long* size) {
    if (!HasFileScheme(m_url.c_str())) return OENetReplySizeFailed;
    char path[1024];
    if (!ConvertFileURLToLocalFileName(path, sizeof path, m_url.c_str())) return OENetReplySizeFailed;
    std::FILE* f = _LDfopen(path, "rb");
    if (!f) {
        Util::GetOps().Message(1, 0, kModule, __LINE__, "OENetRequest::GetReplySize", "cannot open %s", path);
        return OENetReplySizeFailed;
    }
    long n = FileLength(f);
    std::fclose(f);
    if (n < 0) return OENetReplySizeFailed;
    if (size) *size = static_cast<unsigned long>(n);
    return OENetOK;
}

bool OENetRequest::AppendFileInBlocks(const char* path, OEBuffer* buffer) {
    const std::size_t kBlock = 10000;
    std::FILE* f = _LDfopen(path, "rb");
    if (!f) return false;
    char block[kBlock];
    for (;;) {
        std::size_t n = std::fread(block, 1, kBlock, f);
        if (n > 0 && buffer->Write(block, static_cast<unsigned short>(n)) != OEBR_SUCCESS) break;
        if (n < kBlock) break;
    }
    std::fclose(f);
    return true;
}

OENetStatus OENetRequest::LoadReply(OEBuffer* buffer) {
    if (!HasFileScheme(m_url.c_str()) || !buffer) return OENetReplyLoadFailed;
    char path[1024];
    if (!ConvertFileURLToLocalFileName(path, sizeof path, m_url.c_str())) return OENetReplyLoadFailed;
    std::FILE* f = _LDfopen(path, "rb");
    if (!f) {
        Util::GetOps().Message(1, 0, kModule, __LINE__, "OENetRequest::LoadReply", "cannot open %s", path);
        return OENetReplyLoadFailed;
    }
    long n = FileLength(f);
    if (n < 0 || static_cast<unsigned long long>(n) > OEBuffer::kMaxBufferSize) {
        std::fclose(f);
        return OENetReplyLoadFailed;
    }
    if (buffer->AllocateTo(static_cast<unsigned long>(n)) != OEBR_SUCCESS ||
        (n > 0 && !buffer->GetBufferPtr())) {
        std::fclose(f);
        return OENetOutOfMemory;
    }
    std::size_t got = n > 0 ? std::fread(buffer->GetBufferPtr(), 1, static_cast<std::size_t>(n), f) : 0;
    std::fclose(f);
    buffer->SetBufferSize(static_cast<unsigned long>(got));
    buffer->SetBufferOffset(0);
    return OENetOK;
}

unsigned short OENetRequest::GetHeader(const OEString&, OEString& value) {
    value = "";
    return 0;
}

OENetStatus OENetRequest::Abort() {
    return OENetOK;
}

unsigned short OENetRequest::GetStatus(unsigned long* code, unsigned long* httpStatus) {
    if (code) *code = 0;
    if (httpStatus) *httpStatus = 0;
    return 1;
}

void OENetRequest::SetTimeout(long) {}
void OENetRequest::SetSSLVerifyCert(unsigned short) {}
void OENetRequest::SetSaveHeaders(unsigned short) {}
unsigned short OENetRequest::AddTrustedRoot(const unsigned char*, unsigned short, short) {
    return 0;
}
unsigned short OENetRequest::AddTrustedRootBER(const unsigned char*, unsigned short, short) {
    return 0;
}
unsigned short OENetRequest::AddExpectedSSLCertID(const unsigned char*, unsigned short) {
    return 0;
}
unsigned short OENetRequest::AddExpectedSSLCertName(const OEString&) {
    return 0;
}

unsigned short OENetRequest::AddKestivBrandingRoot() {
    const BuiltInRoot& r = g_builtIn[0];
    return r.der ? AddTrustedRoot(r.der, r.length, 1000) : 0;
}

unsigned short OENetRequest::AddVeriSignOFXCARoot() {
    const BuiltInRoot& r = g_builtIn[1];
    return r.der ? AddTrustedRoot(r.der, r.length, 2000) : 0;
}

unsigned short OENetRequest::AddRSAServerRoot() {
    const BuiltInRoot& r = g_builtIn[2];
    return r.der ? AddTrustedRoot(r.der, r.length, 4000) : 0;
}

unsigned short OENetRequest::SetBuiltInRoot(short rootId, const unsigned char* der, unsigned short length) {
    int i = RoleIndex(rootId);
    if (i < 0) return 0;
    unsigned char* copy = nullptr;
    if (der && length) {
        copy = static_cast<unsigned char*>(OEMemory::Malloc(length));
        if (!copy) return 0;
        std::memcpy(copy, der, length);
    }
    OEMemory::Free(g_builtIn[i].der);
    g_builtIn[i].der = copy;
    g_builtIn[i].length = copy ? length : 0;
    return 1;
}

unsigned short OENetRequest::HasFileScheme(const char* url) {
    if (!url) return 0;
    static const char kScheme[] = "file:";
    for (int i = 0; i < 5; ++i) {
        char c = url[i];
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
        if (c != kScheme[i]) return 0;
    }
    return 1;
}

unsigned short OENetRequest::ConvertFileURLToLocalFileName(char* out, std::size_t size, const char* url) {
    if (!out || size == 0) return 0;
    out[0] = '\0';
    if (!HasFileScheme(url)) return 0;
    // "file:" is five characters; the path starts at the seventh, or the eighth after "file://".
    const char* p = url + 5;
    if (*p == '\0') return 0;
    ++p;
    if (*p == '/') ++p;
    // A drive after a third slash starts the path; it is not rooted a second time.
    if (p[0] == '/' && IsDrive(p + 1)) ++p;
#if defined(_WIN32)
    std::size_t n = 0;
    for (; *p; ++p) {
        if (n + 1 >= size) {
            out[0] = '\0';
            return 0;
        }
        out[n++] = *p == '/' ? '\\' : (*p == '|' ? ':' : *p);
    }
    out[n] = '\0';
#else
    // POSIX has no drives: a drive prefix is dropped and what follows is rooted at "/".
    if (IsDrive(p)) p += 2;
    std::size_t n = std::strlen(p);
    if (n + 1 > size) return 0;
    for (std::size_t i = 0; i <= n; ++i) out[i] = p[i] == '|' ? ':' : p[i];
#endif
    return 1;
}

unsigned short OENetRequest::ConvertLocalFileNameToFileURL(char* out, std::size_t size, const char* path) {
    if (!out || size == 0) return 0;
    out[0] = '\0';
    if (!path) return 0;
    const char* prefix;
    if (IsDrive(path))
        prefix = "file:///";
    else if (path[0] == '/' || path[0] == '\\')
        prefix = "file://";
    else
        prefix = "file:/";
    std::size_t n = std::strlen(prefix);
    if (n + std::strlen(path) + 1 > size) return 0;
    std::memcpy(out, prefix, n);
    for (const char* p = path; *p; ++p) {
        char c = *p;
        if (c == '\\') c = '/';
        if (c == ':' && p == path + 1 && IsDrive(path)) c = '|';
        out[n++] = c;
    }
    out[n] = '\0';
    return 1;
}
