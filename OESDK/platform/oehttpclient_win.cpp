// The built-in HTTP client on Windows: WinHTTP (synchronous calls on one background thread per
// transfer) with CryptoAPI for certificates.
//
// Certificates: WinHTTP checks the host name and dates; the chain is built here with
// CertGetCertificateChain, with the request's roots and the trust store file as an extra store,
// and must end in a root the system trusts or in one of those roots. That happens after
// WinHttpSendRequest has sent the request line and headers (the handshake comes with them) and
// before WinHttpWriteData sends the body, which carries the user's credentials: a refused chain
// never sees the body.
#include "platform/oehttpclient.h"

#include "foundation/oememory.h"
#include "platform/internal/oehttpclientbase.h"
#include "platform/oeplatform.h"

#include <windows.h>
#include <wincrypt.h>
#include <winhttp.h>

#include <atomic>
#include <chrono>
#include <condition_variable>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <memory>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

namespace OEPlatform {

int DecodeCertificate(const unsigned char* bytes, unsigned long length, unsigned char** der,
                      unsigned long* derLength, char sha1Hex[41]) {
    *der = nullptr;
    *derLength = 0;
    sha1Hex[0] = '\0';
    PCCERT_CONTEXT c = CertCreateCertificateContext(X509_ASN_ENCODING, bytes, static_cast<DWORD>(length));
    if (!c) return 0;
    int ok = 0;
    BYTE md[20];
    DWORD n = sizeof md;
    unsigned char* out = static_cast<unsigned char*>(OEMemory::Malloc(c->cbCertEncoded));
    if (out && CertGetCertificateContextProperty(c, CERT_SHA1_HASH_PROP_ID, md, &n)) {
        std::memcpy(out, c->pbCertEncoded, c->cbCertEncoded);
        HexOf(md, n, sha1Hex);
        *der = out;
        *derLength = c->cbCertEncoded;
        ok = 1;
    } else {
        OEMemory::Free(out);
    }
    CertFreeCertificateContext(c);
    return ok;
}

int TempDirForModule(void* moduleInstance, char* out, std::size_t size) {
    if (!out || size == 0) return 0;
    out[0] = '\0';
    char base[MAX_PATH + 1];
    DWORD n = GetTempPathA(sizeof base, base);
    if (n == 0 || n > MAX_PATH) return 0;
    std::string dir = base;
    while (dir.size() > 3 && (dir.back() == '\\' || dir.back() == '/')) dir.pop_back();
    char file[MAX_PATH + 1];
    DWORD m = GetModuleFileNameA(static_cast<HMODULE>(moduleInstance), file, sizeof file);
    std::string result = dir;
    if (m > 0 && m < sizeof file) {
        std::string stem(file, m);
        stem = stem.substr(stem.find_last_of("\\/") + 1);
        stem = stem.substr(0, stem.find('.'));
        if (!stem.empty()) {
            std::string candidate = dir + "\\" + stem + "-tmp";
            if (CreateDirectoryA(candidate.c_str(), nullptr) || GetLastError() == ERROR_ALREADY_EXISTS) {
                DWORD attributes = GetFileAttributesA(candidate.c_str());
                if (attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_DIRECTORY))
                    result = candidate;
            }
        }
    }
    if (result.size() + 1 > size) return 0;
    std::memcpy(out, result.c_str(), result.size() + 1);
    return 1;
}

} // namespace OEPlatform

namespace {

std::wstring Widen(const std::string& s) {
    if (s.empty()) return std::wstring();
    int n = MultiByteToWideChar(CP_UTF8, 0, s.data(), static_cast<int>(s.size()), nullptr, 0);
    std::wstring w(static_cast<size_t>(n > 0 ? n : 0), L'\0');
    if (n > 0) MultiByteToWideChar(CP_UTF8, 0, s.data(), static_cast<int>(s.size()), &w[0], n);
    return w;
}

std::string Narrow(const wchar_t* w, size_t length) {
    if (!length) return std::string();
    int n = WideCharToMultiByte(CP_UTF8, 0, w, static_cast<int>(length), nullptr, 0, nullptr, nullptr);
    std::string s(static_cast<size_t>(n > 0 ? n : 0), '\0');
    if (n > 0) WideCharToMultiByte(CP_UTF8, 0, w, static_cast<int>(length), &s[0], n, nullptr, nullptr);
    return s;
}

using OEPlatform::ICRequestBase;
using OEPlatform::ICRoot;
using OEPlatform::ICSessionBase;

struct Request : ICRequestBase {
    HINTERNET session = nullptr;
    std::vector<std::vector<unsigned char>> trustFile; // DER roots of the trust store file
    std::mutex handleLock;                             // guards hRequest against a cancel from another thread
    HINTERNET hRequest = nullptr;
    // Between the transfer's worker and its supervising thread (Supervise): a blocked WinHTTP
    // call that neither a cancel nor the time-out can interrupt is abandoned, and from then on
    // the worker calls nobody back and removes its own files when it finally returns.
    std::mutex stateLock;
    std::condition_variable changed;
    bool workerDone = false;
    bool abandoned = false;
    unsigned long workerCode = 0;
};

struct Session : ICSessionBase {
    HINTERNET internet = nullptr;
};

unsigned long NetError(DWORD e) {
    switch (e) {
    case ERROR_WINHTTP_TIMEOUT:
        return kICNetworkErrorBase | kICErrTimeout;
    case ERROR_WINHTTP_NAME_NOT_RESOLVED:
        return kICNetworkErrorBase | kICErrNameNotResolved;
    case ERROR_WINHTTP_CANNOT_CONNECT:
        return kICNetworkErrorBase | kICErrCannotConnect;
    case ERROR_WINHTTP_OPERATION_CANCELLED:
    case ERROR_INVALID_HANDLE:
        return kICNetworkErrorBase | kICErrOperationCancelled;
    case ERROR_WINHTTP_SECURE_CERT_DATE_INVALID:
        return kICNetworkErrorBase | kICErrCertDateInvalid;
    case ERROR_WINHTTP_SECURE_FAILURE:
    case ERROR_WINHTTP_SECURE_CHANNEL_ERROR:
    case ERROR_WINHTTP_SECURE_INVALID_CERT:
    case ERROR_WINHTTP_SECURE_INVALID_CA:
    case ERROR_WINHTTP_SECURE_CERT_CN_INVALID:
    case ERROR_WINHTTP_SECURE_CERT_REVOKED:
    case ERROR_WINHTTP_SECURE_CERT_WRONG_USAGE:
    case ERROR_WINHTTP_SECURE_CERT_REV_FAILED:
        return kICNetworkErrorBase | kICErrSecureFailure;
    case ERROR_WINHTTP_CONNECTION_ERROR:
        return kICNetworkErrorBase | kICErrConnectionReset;
    default:
        if (e >= 12000 && e < 13000) return kICNetworkErrorBase | e;
        return kICNetworkErrorBase | kICErrInternal;
    }
}

std::FILE* MakeTempFile(const std::string& dir, const char* prefix, std::string& path) {
    char base[MAX_PATH + 1];
    std::string folder = dir;
    if (folder.empty()) {
        DWORD n = GetTempPathA(sizeof base, base);
        if (n == 0 || n > MAX_PATH) return nullptr;
        folder = base;
    }
    char name[MAX_PATH + 1];
    if (!GetTempFileNameA(folder.c_str(), prefix, 0, name)) return nullptr;
    path = name;
    return _LDfopen(name, "wb");
}

void Progress(Request* r, unsigned long kind, unsigned long done, unsigned long total) {
    std::lock_guard<std::mutex> guard(r->stateLock);
    if (!r->callback || r->abandoned) return;
    ICCallbackData d{};
    d.value[0] = kind;
    if (kind == kICProgressSending) {
        d.value[2] = done;
        d.value[4] = total;
    } else if (kind == kICProgressReceiving) {
        d.value[1] = done;
        d.value[3] = total;
    }
    r->callback(kICStatusProgress, &d, r->context);
}

// Builds the server's chain with the extra roots and checks where it ends. Returns 0 to go on,
// or the completion code that refuses the server.
unsigned long CheckServer(Request* r, HINTERNET h) {
    PCCERT_CONTEXT server = nullptr;
    DWORD size = sizeof server;
    if (!WinHttpQueryOption(h, WINHTTP_OPTION_SERVER_CERT_CONTEXT, &server, &size) || !server)
        return kICNetworkErrorBase | kICErrSecureFailure;
    HCERTSTORE extra = CertOpenStore(CERT_STORE_PROV_MEMORY, 0, 0, 0, nullptr);
    std::vector<PCCERT_CONTEXT> anchors; // with the id each one carries (-1: trust store file)
    std::vector<short> ids;
    auto add = [&](const std::vector<unsigned char>& der, short id) {
        PCCERT_CONTEXT c =
            CertCreateCertificateContext(X509_ASN_ENCODING, der.data(), static_cast<DWORD>(der.size()));
        if (!c) return;
        if (extra) CertAddCertificateContextToStore(extra, c, CERT_STORE_ADD_ALWAYS, nullptr);
        anchors.push_back(c);
        ids.push_back(id);
    };
    for (const ICRoot& root : r->roots) add(root.der, root.id);
    for (const auto& der : r->trustFile) add(der, -1);

    unsigned long code = kICNetworkErrorBase | kICErrSecureFailure;
    CERT_CHAIN_PARA para{};
    para.cbSize = sizeof para;
    PCCERT_CHAIN_CONTEXT chain = nullptr;
    if (CertGetCertificateChain(nullptr, server, nullptr, extra, &para, 0, nullptr, &chain) && chain &&
        chain->cChain > 0 && chain->rgpChain[0]->cElement > 0) {
        PCERT_SIMPLE_CHAIN simple = chain->rgpChain[0];
        PCCERT_CONTEXT top = simple->rgpElement[simple->cElement - 1]->pCertContext;
        DWORD errors = chain->TrustStatus.dwErrorStatus;
        short rootId = 0;
        bool anchored = false;
        for (size_t i = 0; i < anchors.size(); ++i)
            if (CertCompareCertificate(X509_ASN_ENCODING, top->pCertInfo, anchors[i]->pCertInfo) &&
                top->cbCertEncoded == anchors[i]->cbCertEncoded &&
                std::memcmp(top->pbCertEncoded, anchors[i]->pbCertEncoded, top->cbCertEncoded) == 0) {
                anchored = true;
                if (ids[i] >= 0) {
                    rootId = ids[i];
                    break;
                }
            }
        bool trusted =
            errors == 0 || (anchored && (errors & ~static_cast<DWORD>(CERT_TRUST_IS_UNTRUSTED_ROOT)) == 0);
        if (r->ignoreErrors) {
            trusted = true;
            rootId = 0;
        }
        if (trusted) {
            code = 0;
            std::lock_guard<std::mutex> guard(r->stateLock);
            if (r->abandoned) {
                code = kICNetworkErrorBase | kICErrOperationCancelled;
            } else if (r->certCallback) {
                std::vector<ICCertificate> certs;
                for (DWORD i = simple->cElement; i > 0; --i) { // root first
                    PCCERT_CONTEXT c = simple->rgpElement[i - 1]->pCertContext;
                    certs.push_back(ICCertificate{c->pbCertEncoded, c->cbCertEncoded});
                }
                long answer = r->certCallback(certs.data(), static_cast<unsigned long>(certs.size()), rootId,
                                              0, r->certContext, 0, 0);
                if (answer != 0) code = static_cast<unsigned long>(answer);
            }
        } else if (errors & (CERT_TRUST_IS_NOT_TIME_VALID)) {
            code = kICNetworkErrorBase | kICErrCertDateInvalid;
        }
    }
    if (chain) CertFreeCertificateChain(chain);
    for (PCCERT_CONTEXT c : anchors) CertFreeCertificateContext(c);
    if (extra) CertCloseStore(extra, 0);
    CertFreeCertificateContext(server);
    return code;
}

unsigned long Transfer(Request* r, std::FILE* reply, std::FILE* headers) {
    std::wstring url = Widen(r->url);
    URL_COMPONENTS parts{};
    parts.dwStructSize = sizeof parts;
    parts.dwHostNameLength = static_cast<DWORD>(-1);
    parts.dwUrlPathLength = static_cast<DWORD>(-1);
    parts.dwExtraInfoLength = static_cast<DWORD>(-1);
    parts.dwSchemeLength = static_cast<DWORD>(-1);
    if (!WinHttpCrackUrl(url.c_str(), 0, 0, &parts)) return NetError(GetLastError());
    bool https = parts.nScheme == INTERNET_SCHEME_HTTPS;
    if (!https && parts.nScheme != INTERNET_SCHEME_HTTP) return kICNetworkErrorBase | 12006;
    std::wstring host(parts.lpszHostName, parts.dwHostNameLength);
    std::wstring path(parts.lpszUrlPath, parts.dwUrlPathLength);
    path.append(parts.lpszExtraInfo, parts.dwExtraInfoLength);
    if (path.empty()) path = L"/";

    HINTERNET connect = WinHttpConnect(r->session, host.c_str(), parts.nPort, 0);
    if (!connect) return NetError(GetLastError());
    DWORD flags = (https ? WINHTTP_FLAG_SECURE : 0) | (r->noCache ? WINHTTP_FLAG_REFRESH : 0);
    HINTERNET h = WinHttpOpenRequest(connect, r->post ? L"POST" : L"GET", path.c_str(), nullptr,
                                     WINHTTP_NO_REFERER, WINHTTP_DEFAULT_ACCEPT_TYPES, flags);
    if (!h) {
        DWORD e = GetLastError();
        WinHttpCloseHandle(connect);
        return NetError(e);
    }
    {
        std::lock_guard<std::mutex> guard(r->handleLock);
        r->hRequest = h;
    }
    auto closeRequest = [r]() {
        std::lock_guard<std::mutex> guard(r->handleLock);
        if (r->hRequest) WinHttpCloseHandle(r->hRequest);
        r->hRequest = nullptr;
    };
    unsigned long code = 0;
    if (r->cancelled.load()) code = kICNetworkErrorBase | kICErrOperationCancelled;

    // Like the POSIX client: no redirects, so the request (and its credentials) goes to the
    // server that was checked and nowhere else.
    DWORD redirects = WINHTTP_OPTION_REDIRECT_POLICY_NEVER;
    WinHttpSetOption(h, WINHTTP_OPTION_REDIRECT_POLICY, &redirects, sizeof redirects);
    int ms = r->timeout > 0 ? static_cast<int>(r->timeout * 1000) : 0;
    if (code == 0) WinHttpSetTimeouts(h, ms ? ms : 0, ms ? ms : 30000, ms ? ms : 120000, ms ? ms : 120000);
    if (code == 0 && https) {
        // The CA check is ours (CheckServer); names and dates stay WinHTTP's unless told otherwise.
        DWORD security = SECURITY_FLAG_IGNORE_UNKNOWN_CA;
        if (r->ignoreErrors)
            security |= SECURITY_FLAG_IGNORE_CERT_DATE_INVALID | SECURITY_FLAG_IGNORE_CERT_CN_INVALID |
                        SECURITY_FLAG_IGNORE_CERT_WRONG_USAGE;
        WinHttpSetOption(h, WINHTTP_OPTION_SECURITY_FLAGS, &security, sizeof security);
    }
    std::string head;
    if (r->post)
        head +=
            "Content-Type: " + (r->contentType.empty() ? std::string("application/x-ofx") : r->contentType) +
            "\r\n";
    if (r->noCache) head += "Pragma: no-cache\r\nCache-Control: no-cache\r\n";
    if (!r->extraHeaders.empty()) {
        head += r->extraHeaders;
        if (head.back() != '\n') head += "\r\n";
    }
    std::wstring wideHead = Widen(head);
    Progress(r, kICProgressConnecting, 0, 0);
    DWORD total = static_cast<DWORD>(r->body.size());
    if (code == 0 &&
        !WinHttpSendRequest(h, wideHead.empty() ? WINHTTP_NO_ADDITIONAL_HEADERS : wideHead.c_str(),
                            static_cast<DWORD>(-1L), WINHTTP_NO_REQUEST_DATA, 0, total, 0))
        code = NetError(GetLastError());
    if (code == 0 && https) code = CheckServer(r, h);
    for (DWORD sent = 0; code == 0 && sent < total;) {
        DWORD piece = total - sent < 16384 ? total - sent : 16384, wrote = 0;
        if (r->cancelled.load())
            code = kICNetworkErrorBase | kICErrOperationCancelled;
        else if (!WinHttpWriteData(h, r->body.data() + sent, piece, &wrote) || wrote == 0)
            code = NetError(GetLastError());
        sent += wrote;
        Progress(r, kICProgressSending, sent, total);
    }
    if (code == 0 && !WinHttpReceiveResponse(h, nullptr)) code = NetError(GetLastError());
    DWORD status = 0;
    if (code == 0) {
        DWORD size = sizeof status;
        WinHttpQueryHeaders(h, WINHTTP_QUERY_STATUS_CODE | WINHTTP_QUERY_FLAG_NUMBER,
                            WINHTTP_HEADER_NAME_BY_INDEX, &status, &size, WINHTTP_NO_HEADER_INDEX);
        DWORD bytes = 0;
        WinHttpQueryHeaders(h, WINHTTP_QUERY_RAW_HEADERS_CRLF, WINHTTP_HEADER_NAME_BY_INDEX,
                            WINHTTP_NO_OUTPUT_BUFFER, &bytes, WINHTTP_NO_HEADER_INDEX);
        if (bytes > 0) {
            std::vector<wchar_t> raw(bytes / sizeof(wchar_t) + 1);
            if (WinHttpQueryHeaders(h, WINHTTP_QUERY_RAW_HEADERS_CRLF, WINHTTP_HEADER_NAME_BY_INDEX,
                                    raw.data(), &bytes, WINHTTP_NO_HEADER_INDEX)) {
                std::string text = Narrow(raw.data(), bytes / sizeof(wchar_t));
                std::fwrite(text.data(), 1, text.size(), headers);
            }
        }
        DWORD length = 0;
        size = sizeof length;
        if (!WinHttpQueryHeaders(h, WINHTTP_QUERY_CONTENT_LENGTH | WINHTTP_QUERY_FLAG_NUMBER,
                                 WINHTTP_HEADER_NAME_BY_INDEX, &length, &size, WINHTTP_NO_HEADER_INDEX))
            length = 0;
        unsigned long received = 0;
        std::vector<char> block(16384);
        for (;;) {
            DWORD got = 0;
            if (r->cancelled.load()) {
                code = kICNetworkErrorBase | kICErrOperationCancelled;
                break;
            }
            if (!WinHttpReadData(h, block.data(), static_cast<DWORD>(block.size()), &got)) {
                code = NetError(GetLastError());
                break;
            }
            if (got == 0) break;
            std::fwrite(block.data(), 1, got, reply);
            received += got;
            Progress(r, kICProgressReceiving, received, length);
        }
    }
    if (code == 0 && (status < 200 || status >= 300)) code = kICHttpStatusBase | (status & 0xFFFFu);
    // A cancel makes the blocked call fail in various ways; a refusal by the certificate check
    // (codes below the client's ranges) stays what it is.
    if (code >= kICNetworkErrorBase && r->cancelled.load())
        code = kICNetworkErrorBase | kICErrOperationCancelled;
    closeRequest();
    WinHttpCloseHandle(connect);
    return code;
}

void Supervise(std::shared_ptr<Request> r) {
    unsigned long code;
    std::FILE* reply = MakeTempFile(r->tempDir, "oer", r->replyPath);
    std::FILE* headers = reply ? MakeTempFile(r->tempDir, "oeh", r->headerPath) : nullptr;
    if (!reply || !headers) {
        if (reply) std::fclose(reply);
        if (headers) std::fclose(headers);
        code = kICNetworkErrorBase | kICErrInternal;
    } else {
        try {
            std::thread([r, reply, headers] {
                unsigned long result = Transfer(r.get(), reply, headers);
                std::fclose(reply);
                std::fclose(headers);
                std::lock_guard<std::mutex> guard(r->stateLock);
                r->workerDone = true;
                r->workerCode = result;
                if (r->abandoned) {
                    _LDunlink(r->replyPath.c_str());
                    _LDunlink(r->headerPath.c_str());
                }
                r->changed.notify_all();
            }).detach();
            std::unique_lock<std::mutex> lock(r->stateLock);
            auto finished = [&r] { return r->workerDone || r->cancelled.load(); };
            if (r->timeout > 0)
                r->changed.wait_for(lock, std::chrono::seconds(r->timeout), finished);
            else
                r->changed.wait(lock, finished);
            if (r->workerDone) {
                code = r->workerCode;
            } else {
                r->abandoned = true;
                code = kICNetworkErrorBase | (r->cancelled.load() ? kICErrOperationCancelled : kICErrTimeout);
            }
        } catch (...) {
            std::fclose(reply);
            std::fclose(headers);
            code = kICNetworkErrorBase | kICErrInternal;
        }
    }
    r->Finish(code);
}

// The DER certificates of a PEM file.
bool ReadPemFile(const char* path, std::vector<std::vector<unsigned char>>& out) {
    std::FILE* f = _LDfopen(path, "rb");
    if (!f) return false;
    std::string text;
    char block[4096];
    size_t n;
    while ((n = std::fread(block, 1, sizeof block, f)) > 0) text.append(block, n);
    std::fclose(f);
    const std::string begin = "-----BEGIN CERTIFICATE-----", end = "-----END CERTIFICATE-----";
    size_t at = 0;
    while ((at = text.find(begin, at)) != std::string::npos) {
        size_t stop = text.find(end, at);
        if (stop == std::string::npos) break;
        std::string pem = text.substr(at, stop + end.size() - at);
        DWORD size = 0;
        if (CryptStringToBinaryA(pem.c_str(), static_cast<DWORD>(pem.size()), CRYPT_STRING_BASE64HEADER,
                                 nullptr, &size, nullptr, nullptr)) {
            std::vector<unsigned char> der(size);
            if (CryptStringToBinaryA(pem.c_str(), static_cast<DWORD>(pem.size()), CRYPT_STRING_BASE64HEADER,
                                     der.data(), &size, nullptr, nullptr))
                out.push_back(std::move(der));
        }
        at = stop + end.size();
    }
    return !out.empty();
}

class WinHttpClient : public OEPlatform::OEHttpClientBase {
public:
    long ICNeedsInternetSetup() override { return 0; }

    ICSession ICOpenInet(long* error, const char* agentName) override {
        std::wstring agent = Widen(agentName && *agentName ? agentName : "OESDK");
        HINTERNET internet = WinHttpOpen(agent.c_str(), WINHTTP_ACCESS_TYPE_DEFAULT_PROXY,
                                         WINHTTP_NO_PROXY_NAME, WINHTTP_NO_PROXY_BYPASS, 0);
        if (!internet) {
            if (error) *error = static_cast<long>(NetError(GetLastError()));
            return nullptr;
        }
        Session* s = new (std::nothrow) Session;
        if (!s) {
            WinHttpCloseHandle(internet);
            if (error) *error = static_cast<long>(kICNetworkErrorBase | kICErrInternal);
            return nullptr;
        }
        s->internet = internet;
        if (error) *error = 0;
        return static_cast<ICSessionBase*>(s);
    }

    long ICConnect(long) override { return 0; }

    long ICCloseInet(ICSession session) override {
        Session* s = static_cast<Session*>(static_cast<ICSessionBase*>(session));
        if (!s) return 12018;
        EndSession(*s);
        WinHttpCloseHandle(s->internet);
        delete s;
        return 0;
    }

    long ICSetTrustStoreFile(const char* pemFile) override {
        std::vector<std::vector<unsigned char>> roots;
        if (pemFile && !ReadPemFile(pemFile, roots)) return 2;
        std::lock_guard<std::mutex> guard(m_lock);
        m_trustFile = std::move(roots);
        return 0;
    }

protected:
    std::shared_ptr<ICRequestBase> NewRequest(ICSessionBase& s) override {
        std::shared_ptr<Request> r(new (std::nothrow) Request);
        if (r) r->session = static_cast<Session&>(s).internet;
        return r;
    }

    void TakeTrustStore(ICRequestBase& r) override { static_cast<Request&>(r).trustFile = m_trustFile; }

    void Run(std::shared_ptr<ICRequestBase> r) override { Supervise(std::static_pointer_cast<Request>(r)); }

    // Closing the request handle makes a blocked WinHTTP call on the transfer thread return.
    void Cancel(ICRequestBase& base) override {
        Request* r = static_cast<Request*>(&base);
        r->cancelled.store(true);
        {
            std::lock_guard<std::mutex> state(r->stateLock);
            r->changed.notify_all();
        }
        std::lock_guard<std::mutex> guard(r->handleLock);
        if (r->hRequest) WinHttpCloseHandle(r->hRequest);
        r->hRequest = nullptr;
    }

private:
    std::vector<std::vector<unsigned char>> m_trustFile; // guarded by m_lock
};

} // namespace

OEHttpClient* OEHttpClient::GetDefault() {
    static WinHttpClient client;
    return &client;
}
