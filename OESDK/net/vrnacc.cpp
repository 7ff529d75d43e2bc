// HTTP(S) transport over the host's HTTP client.
#include "net/vrnacc.h"

#include "foundation/oememory.h"
#include "platform/oeplatform.h"

#include <cstdarg>
#include <cstdio>
#include <cstring>
#include <mutex>

namespace {
const char kModule[] = "vrnacc";

bool IsHttpsScheme(const char* url) {
    return std::strncmp(url, "https:", 6) == 0;
}

void CopyPath(char (&out)[1024], const char* in) {
    std::snprintf(out, sizeof out, "%s", in ? in : "");
}

void RemoveFile(const char* path) {
    if (path && *path) _LDunlink(path);
}
} // namespace

// The client's callbacks reach a request through a ticket, never directly: a transfer that
// outlives the wait (a quit message) or the request itself then finds no owner and only
// removes its files. The client holds one reference from ICInitiate until its completion.
struct VRNTicket {
    std::mutex lock;
    VRNNetRequest* owner;
    int references;
};

namespace {
void DropReference(VRNTicket* t) {
    bool last;
    {
        std::lock_guard<std::mutex> guard(t->lock);
        last = --t->references == 0;
    }
    if (last) delete t;
}
} // namespace

// ---- VRNNetAccess ---------------------------------------------------------------------------

VRNNetAccess::VRNNetAccess() : m_session(nullptr), m_externalSession(0), m_connected(0), m_lastError(0) {}

VRNNetAccess::~VRNNetAccess() {
    if (m_session && m_externalSession != 1) EndConnection();
}

OENetStatus VRNNetAccess::OpenInternetIfNeeded() {
    OEHttpClient* client = GetClient();
    if (m_externalSession != 1 && !m_session) {
        long error = 0;
        OEString agent = GetAgentName();
        m_session = client->ICOpenInet(&error, agent.c_str());
        if (!m_session || error != 0) {
            LogFormat(OENetLogError, "***VRN: ICOpenInet returns %d", static_cast<int>(error));
            if (m_session) client->ICCloseInet(m_session);
            m_session = nullptr;
            m_lastError = static_cast<std::uint32_t>(error);
            return OENetOpenFailed;
        }
    }
    if (!m_session || m_connected) {
        m_lastError = 0;
        return OENetOK;
    }
    long code = client->ICConnect(0);
    if (code == 0) {
        m_connected = 1;
        return OENetOK;
    }
    LogFormat(OENetLogError, "***VRN: ICConnect returns %d", static_cast<int>(code));
    m_lastError = static_cast<std::uint32_t>(code);
    return code == 2200 ? OENetNotAvailable : OENetOpenFailed;
}

OENetStatus VRNNetAccess::EndConnection() {
    long code = 0;
    OENetStatus status = OENetOK;
    if (m_externalSession != 1 && m_session) {
        code = GetClient()->ICCloseInet(m_session);
        if (code != 0) {
            LogFormat(OENetLogError, "***VRN: ICCloseInet returns %d", static_cast<int>(code));
            status = OENetCloseFailed;
        }
    }
    m_session = nullptr;
    m_externalSession = 0;
    m_connected = 0;
    m_lastError = static_cast<std::uint32_t>(code);
    return status;
}

OENetRequest* VRNNetAccess::NewNetRequest() {
    return OEMemory::New<VRNNetRequest>(this);
}

unsigned short VRNNetAccess::IsNetworkSetup() {
    return GetClient()->ICNeedsInternetSetup() == 0 ? 1 : 0;
}

unsigned short VRNNetAccess::GetStatus(unsigned long* status) {
    if (status) *status = m_lastError;
    return 1;
}

void VRNNetAccess::SetGlobalState(void* state) {
    m_session = state;
    m_externalSession = state ? 1 : 0;
    m_connected = 0;
}

void VRNNetAccess::SetupTempPathFromHInst(void* moduleInstance, OEString& out) {
    char path[1024];
    out = OEPlatform::TempDirForModule(moduleInstance, path, sizeof path) ? path : "";
}

// ---- VRNNetRequest --------------------------------------------------------------------------

VRNNetRequest::VRNNetRequest(VRNNetAccess* access)
    : m_access(access), m_ticket(nullptr), m_transfer(nullptr), m_done(1), m_completionCode(0),
      m_replySize(0), m_timeout(0), m_verifyCert(1), m_request(nullptr), m_trustedRoots(1, 5),
      m_expectedIDs(2, 2), m_expectedNames(2, 2), m_replyHeaders(0, 1024), m_saveHeaders(0), m_httpStatus(0) {
    m_replyFile[0] = '\0';
    m_headerFile[0] = '\0';
}

VRNNetRequest::~VRNNetRequest() {
    if (!m_done.load() && m_transfer && m_access)
        m_access->GetClient()->ICCancel(m_access->m_session, m_transfer);
    ReleaseTicket();
    if (m_replySize) { // a reply nobody loaded
        RemoveFile(m_replyFile);
        RemoveFile(m_headerFile);
    }
}

bool VRNNetRequest::NewTicket() {
    // A fresh ticket: callbacks of an earlier transfer that is still winding down go nowhere.
    ReleaseTicket();
    m_ticket = OEMemory::New<VRNTicket>();
    if (!m_ticket) return false;
    m_ticket->owner = this;
    m_ticket->references = 1;
    return true;
}

void VRNNetRequest::ReleaseTicket() {
    if (!m_ticket) return;
    {
        std::lock_guard<std::mutex> guard(m_ticket->lock); // waits for a callback in progress
        m_ticket->owner = nullptr;
    }
    DropReference(m_ticket);
    m_ticket = nullptr;
}

void VRNNetRequest::Log(unsigned short level, const char* format, ...) {
    if (!m_access) return;
    va_list args;
    va_start(args, format);
    m_access->LogFormatV(level, format, args);
    va_end(args);
}

OENetStatus VRNNetRequest::Send(const OEString& url, OEBuffer* body) {
    return SendPlusHeadersContent(url, body, nullptr, nullptr);
}

OENetStatus VRNNetRequest::SendPlusHeaders(const OEString& url, OEBuffer* body, const char* headers) {
    return SendPlusHeadersContent(url, body, headers, nullptr);
}

OENetStatus VRNNetRequest::SendPlusHeadersContent(const OEString& url, OEBuffer* body, const char* headers,
                                                  const char* contentType) {
    m_request = nullptr;
    m_url = url;
    Log(OENetLogDetail, "VRN: Beginning send to %s", url.c_str());
    OENetStatus status = m_access ? Begin(true, body, contentType, headers) : OENetRequestFailed;
    Log(OENetLogDetail, "VRN: End send to %s, netstatus %d", url.c_str(), static_cast<int>(status));
    m_request = nullptr;
    return status;
}

OENetStatus VRNNetRequest::Get(const OEString& url) {
    Log(OENetLogDetail, "VRN: Beginning get from %s", url.c_str());
    m_request = nullptr;
    if (OENetRequest::Get(url) == OENetOK) return OENetOK;
    m_url = url;
    OENetStatus status = OENetOK;
    if (!m_access || url.IsEmpty()) {
        Log(OENetLogError, "***VRN: ICGetFileRequest returns %d", 3);
        status = OENetRequestFailed;
    } else {
        status = Begin(false, nullptr, nullptr, nullptr);
    }
    Log(OENetLogDetail, "VRN: End get from %s, netstatus %d", url.c_str(), static_cast<int>(status));
    m_request = nullptr;
    return status;
}

// Opens the session when needed, makes the client request for m_url (a POST of body, or a GET)
// and carries it through Transfer.
OENetStatus VRNNetRequest::Begin(bool post, OEBuffer* body, const char* contentType, const char* headers) {
    OEString temp = m_access->GetTempFilePath();
    OENetStatus status = m_access->OpenInternetIfNeeded();
    if (status == OENetOK && !NewTicket()) status = OENetOutOfMemory;
    if (status != OENetOK) return status;
    OEHttpClient* client = m_access->GetClient();
    long result = 0;
    if (post) {
        const char* bytes = body && body->GetBufferPtr() ? body->GetBufferPtr() : "";
        unsigned long length = body && body->GetBufferPtr() ? body->GetBufferSize() : 0;
        m_request = client->ICSendDataRequest(&result, m_access->m_session, m_url.c_str(), bytes, length,
                                              temp.c_str(), CompletionCallback, m_ticket);
    } else {
        m_request = client->ICGetFileRequest(&result, m_access->m_session, m_url.c_str(), temp.c_str(),
                                             CompletionCallback, m_ticket);
    }
    if (result != 0 || !m_request) {
        Log(OENetLogError, post ? "***VRN ICSendDataRequest:  %d" : "***VRN: ICGetFileRequest returns %d",
            static_cast<int>(result));
        return OENetRequestFailed;
    }
    return Transfer(post, contentType, headers);
}

// Steps after the client made the request: TLS settings, HTTP settings, start, wait, results.
OENetStatus VRNNetRequest::Transfer(bool post, const char* contentType, const char* headers) {
    OEHttpClient* client = m_access->GetClient();
    const char* url = m_url.c_str();
    if (IsHttpsScheme(url)) {
        long rc = client->ICSetSSLInfo(m_request, m_verifyCert != 1 ? 1 : 0);
        if (rc != 0) {
            Log(OENetLogError, post ? "***VRN ICSetSSLInfo:  %d (Send)" : "***VRN ICSetSSLInfo:  %d (Get)",
                static_cast<int>(rc));
            return OENetSSLSetupFailed;
        }
    }
    // The roots and the certificate check go to the client whatever the scheme's spelling: a
    // client that speaks TLS for "HTTPS:" too must not skip them.
    long rc = client->ICSetCertificateCallback(m_request, VRNSSLCertificateCallback, m_ticket);
    if (rc != 0) {
        Log(OENetLogError, "***VRN ICSetCertificateCallback:  %d", static_cast<int>(rc));
        return OENetSSLSetupFailed;
    }
    AddAllTrustedRoots(m_request);

    if (m_timeout != 0) {
        if (post)
            rc = client->ICSetHTTPInfo(m_request, 0, 1, contentType ? contentType : "application/x-ofx",
                                       headers, 1, m_timeout);
        else
            rc = client->ICSetHTTPInfo(m_request, 0, 0, nullptr, nullptr, 1, m_timeout);
        if (rc != 0) {
            // Logged, but reported as success without sending: hosts rely on this.
            Log(OENetLogError, "***VRN ICSetHTTPInfo:  %d", static_cast<int>(rc));
            return OENetOK;
        }
    }

    m_done.store(0);
    m_completionCode = 0;
    m_replySize = 0;
    m_httpStatus = 0;
    m_replyFile[0] = '\0';
    m_headerFile[0] = '\0';
    m_ticket->references = 2; // the client's reference, given back by its completion
    m_transfer = m_request;
    rc = client->ICInitiate(m_access->m_session, m_request, 0, 0);
    if (rc != 0) {
        m_ticket->references = 1;
        m_done.store(1);
        Log(OENetLogError, post ? "***VRN ICInitiate:  %d" : "***VRN: ICInitiate returns %d",
            static_cast<int>(rc));
        return OENetInitiateFailed;
    }

    Wait();
    if (!m_done.load()) {
        // The wait ended by a quit message: stop the transfer and let it end on its own.
        client->ICCancel(m_access->m_session, m_request);
        ReleaseTicket();
    }

    if (m_saveHeaders == 1) {
        m_replyHeaders.ClearBuffer(0);
        AppendFileInBlocks(m_headerFile, &m_replyHeaders);
    }
    if (m_completionCode != 0 || m_replySize == 0) {
        RemoveFile(m_replyFile);
        RemoveFile(m_headerFile);
        m_replySize = 0;
    }
    return MapNetStatus(m_completionCode);
}

void VRNNetRequest::Wait() {
    while (!m_done.load()) {
        if (OEPlatform::PumpMessages()) break; // a quit message: posted again for the host
        if (m_done.load()) break;
        OEPlatform::Sleep(100);
    }
}

void VRNNetRequest::CompletionCallback(unsigned long status, const ICCallbackData* data, void* context) {
    VRNTicket* t = static_cast<VRNTicket*>(context);
    if (!t) return;
    {
        std::lock_guard<std::mutex> guard(t->lock);
        if (t->owner) {
            t->owner->DoCallback(status, data);
        } else if (status == kICStatusFinished && data) { // nobody waits for this reply any more
            RemoveFile(data->replyFile);
            RemoveFile(data->headerFile);
        }
    }
    if (status == kICStatusFinished) DropReference(t);
}

void VRNNetRequest::DoCallback(unsigned long status, const ICCallbackData* data) {
    if (!data) return;
    if (status == kICStatusProgress) {
        if (!m_access) return;
        if (data->value[0] == kICProgressSending)
            m_access->Progress(data->value[2], data->value[4]);
        else if (data->value[0] == kICProgressReceiving)
            m_access->Progress(data->value[1], data->value[3]);
        else
            m_access->Progress(0, 0);
        return;
    }
    if (status != kICStatusFinished) return;
    CopyPath(m_replyFile, data->replyFile);
    CopyPath(m_headerFile, data->headerFile);
    OEFileStat st;
    if (m_replyFile[0] && _LD_stat(m_replyFile, &st) == 0) {
        m_replySize = st.size > 0xFFFFFFFFll ? 0xFFFFFFFFu : static_cast<std::uint32_t>(st.size);
    } else {
        m_replySize = 0;
        Util::GetOps().Message(1, 0, kModule, 956, "VRNNetRequest::DoCallback",
                               "cannot examine reply file %s", m_replyFile);
    }
    if (data->code != 0) {
        m_completionCode = static_cast<std::uint32_t>(data->code);
        m_httpStatus = static_cast<std::uint32_t>(MapHttpStatus(data->code));
        Log(OENetLogError, "***VRN kVRFInished: returns %d", static_cast<int>(data->code));
    } else {
        m_httpStatus = 200;
    }
    m_done.store(1);
}

long VRNNetRequest::VRNSSLCertificateCallback(const ICCertificate* chain, unsigned long count, short rootId,
                                              long error, void* context, long, long) {
    VRNTicket* t = static_cast<VRNTicket*>(context);
    if (!t) return 1670;
    std::lock_guard<std::mutex> guard(t->lock);
    if (!t->owner) return 1670; // nobody to vouch for the server any more
    return t->owner->CheckCertificate(chain, count, rootId, error);
}

long VRNNetRequest::CheckCertificate(const ICCertificate* chain, unsigned long count, short rootId,
                                     long error) {
    if (error != 0) {
        Log(OENetLogError, "***VRN: SSL certificate error: %d", static_cast<int>(error));
        return error;
    }
    if ((rootId / 1000) * 1000 == 3000) {
        Log(OENetLogError, "***VRN: VeriSign Class 3 PCA is not accepted as a trusted root.");
        return 1671;
    }
    if (m_trustedRoots.Entries() > 0) {
        bool found = false;
        for (unsigned short i = 0; i < m_trustedRoots.Entries() && !found; ++i)
            found = m_trustedRoots[i] && m_trustedRoots[i]->GetID() == rootId;
        if (!found) return 1670;
    }
    if (!chain || count == 0) return 1670;
    const ICCertificate& last = chain[count - 1];
    OECertificate cert;
    if (!cert.ParseDER(last.der, last.length)) return 1670;
    if (m_expectedIDs.Entries() > 0) {
        char id[41];
        cert.GetCertID(id, sizeof id);
        bool match = false;
        for (unsigned short i = 0; i < m_expectedIDs.Entries() && !match; ++i) {
            OEBuffer* want = &m_expectedIDs[i]->bytes;
            char norm[128];
            OECertificate::NormalizeID(want->GetBufferPtr(), want->GetBufferSize(), norm, sizeof norm);
            match = std::strcmp(norm, id) == 0;
        }
        if (!match) {
            auto text = [this](unsigned short i) {
                OEBuffer& b = m_expectedIDs[i]->bytes;
                return b.GetBufferPtr() ? b.GetBufferPtr() : "";
            };
            if (m_expectedIDs.Entries() == 1)
                Log(OENetLogError, "***VRN: SSL Cert ID failure: Expecting \"%s\", received \"%s\"", text(0),
                    id);
            else
                Log(OENetLogError, "***VRN: SSL Cert ID failure: Expecting \"%s\" or \"%s\", received \"%s\"",
                    text(0), text(1), id);
            return 1673;
        }
    }
    Log(OENetLogDetail, "VRN: Received trusted root %d (%s)", static_cast<int>(rootId),
        RootGroupName(rootId));
    return 0;
}

const char* VRNNetRequest::RootGroupName(short rootId) {
    switch ((rootId / 1000) * 1000) {
    case 0:
        return "none";
    case 1000:
        return "Kestiv Branding CA";
    case 2000:
        return "VeriSign OFX CA";
    case 4000:
        return "RSA Secure Server CA";
    default:
        return "unknown";
    }
}

unsigned long VRNNetRequest::MapHttpStatus(unsigned long code) {
    unsigned long high = code >> 16, low = code & 0xFFFFu;
    if (high == 0x0403u) {
        if ((low >= 201 && low <= 204) || (low >= 301 && low <= 304) || (low >= 400 && low <= 408) ||
            (low >= 500 && low <= 504))
            return low;
        return 200;
    }
    if (high == 0x0401u) {
        if (low == 12002) return 408;
        if (low == 12007) return 504;
    }
    return 200;
}

OENetStatus VRNNetRequest::MapNetStatus(unsigned long code) {
    if (code == 0) return OENetOK;
    if (code == kICNotAvailable) return OENetNotAvailable;
    unsigned long high = code >> 16, low = code & 0xFFFFu;
    if (high == 0x0403u) {
        if ((low >= 400 && low <= 407) || (low >= 409 && low <= 415)) return OENetHttpClientError;
        if (low == 408) return OENetTimeout;
        if (low == 501 || low == 502) return OENetNotImplemented;
        if (low == 503 || low == 504) return OENetServerUnavailable;
        return OENetUnknownError;
    }
    if (high == 0x0401u) {
        switch (low) {
        case 12002:
            return OENetTimeout;
        case 12007:
            return OENetServerUnavailable;
        case 12029:
            return OENetCannotConnect;
        case 12037:
        case 12157:
            return OENetSecurityError;
        default:
            return OENetUnknownError;
        }
    }
    return OENetUnknownError;
}

OENetStatus VRNNetRequest::LoadReply(OEBuffer* buffer) {
    if (HasFileScheme(m_url.c_str())) return OENetRequest::LoadReply(buffer);
    if (!buffer || m_replySize == 0) return OENetReplyLoadFailed;
    if (!AppendFileInBlocks(m_replyFile, buffer)) return OENetReplyLoadFailed;
    RemoveFile(m_replyFile);
    RemoveFile(m_headerFile);
    std::uint32_t expected = m_replySize;
    m_replySize = 0;
    return buffer->GetBufferSize() == expected ? OENetOK : OENetReplyLoadFailed;
}

OENetStatus VRNNetRequest::GetReplySize(unsigned long* size) {
    if (HasFileScheme(m_url.c_str())) return OENetRequest::GetReplySize(size);
    if (m_replySize == 0) return OENetReplySizeFailed;
    if (size) *size = m_replySize;
    return OENetOK;
}

unsigned short VRNNetRequest::GetHeader(const OEString& name, OEString& value) {
    value = "";
    const char* p = m_replyHeaders.GetBufferPtr();
    unsigned long n = m_replyHeaders.GetBufferSize();
    std::size_t nameLength = name.GetStrLength();
    if (!p || nameLength == 0) return 0;
    unsigned long i = 0;
    while (i < n) {
        unsigned long end = i;
        while (end < n && p[end] != '\n') ++end;
        unsigned long lineEnd = end;
        if (lineEnd > i && p[lineEnd - 1] == '\r') --lineEnd;
        if (lineEnd - i > nameLength && p[i + nameLength] == ':') {
            OEString key(p + i, static_cast<unsigned short>(nameLength));
            if (key.strcmpi(name.c_str()) == 0) {
                unsigned long v = i + nameLength + 1;
                while (v < lineEnd && (p[v] == ' ' || p[v] == '\t')) ++v;
                unsigned long len = lineEnd - v;
                value.Assign(p + v, static_cast<unsigned short>(len > 65534 ? 65534 : len));
                return 1;
            }
        }
        i = end + 1;
    }
    return 0;
}

OENetStatus VRNNetRequest::Abort() {
    if (!m_request || !m_access) return OENetOK;
    long rc = m_access->GetClient()->ICCancel(m_access->m_session, m_request);
    if (rc != 0) {
        Log(OENetLogError, "***VRN ICCancel:  %d", static_cast<int>(rc));
        return OENetCancelFailed;
    }
    return OENetOK;
}

unsigned short VRNNetRequest::GetStatus(unsigned long* code, unsigned long* httpStatus) {
    if (code) *code = m_completionCode;
    if (httpStatus) *httpStatus = m_httpStatus;
    return 1;
}

unsigned short VRNNetRequest::AppendRoot(const unsigned char* bytes, unsigned short length, short rootId,
                                         bool ber) {
    OECertificate* cert = OEMemory::New<OECertificate>();
    if (!cert) return 0;
    unsigned short ok = ber ? cert->ParseBER(bytes, length) : cert->ParseDER(bytes, length);
    if (!ok) {
        delete cert;
        return 0;
    }
    cert->SetID(rootId);
    if (!m_trustedRoots.Set(m_trustedRoots.Entries(), cert)) {
        delete cert;
        return 0;
    }
    return 1;
}

unsigned short VRNNetRequest::AddTrustedRoot(const unsigned char* der, unsigned short length, short rootId) {
    return AppendRoot(der, length, rootId, false);
}

unsigned short VRNNetRequest::AddTrustedRootBER(const unsigned char* ber, unsigned short length,
                                                short rootId) {
    return AppendRoot(ber, length, rootId, true);
}

void VRNNetRequest::AddAllTrustedRoots(ICRequest request) {
    OEHttpClient* client = m_access->GetClient();
    for (unsigned short i = 0; i < m_trustedRoots.Entries(); ++i) {
        OECertificate* root = m_trustedRoots[i];
        if (!root || !root->IsValid()) continue;
        long rc = client->ICAddTrustedRoot(request, root->GetDER(), root->GetDERLength(), root->GetID());
        if (rc != 0) // the check then finds the chain anchored elsewhere and refuses it
            Log(OENetLogError, "***VRN ICAddTrustedRoot:  %d", static_cast<int>(rc));
    }
}

unsigned short VRNNetRequest::AddExpectedSSLCertID(const unsigned char* id, unsigned short length) {
    if (!id || !length) return 0;
    VRNExpectedID* e = OEMemory::New<VRNExpectedID>();
    if (!e) return 0;
    OEBuffer* b = &e->bytes;
    if (b->Write(reinterpret_cast<const char*>(id), length) != OEBR_SUCCESS ||
        b->Write('\0') != OEBR_SUCCESS || !m_expectedIDs.Append(e)) {
        delete e;
        return 0;
    }
    b->SetBufferSize(length); // the terminating NUL stays behind the data for logging
    return 1;
}

unsigned short VRNNetRequest::AddExpectedSSLCertName(const OEString& name) {
    return m_expectedNames.AddString(name);
}

unsigned short VRNNetRequest::IsAnExpectedSSLCertName(const OEString& name) const {
    for (unsigned short i = 0; i < m_expectedNames.Entries(); ++i) {
        const OEString* s = m_expectedNames.GetString(i);
        if (s && s->strcmpi(name.c_str()) == 0) return 1;
    }
    return 0;
}
