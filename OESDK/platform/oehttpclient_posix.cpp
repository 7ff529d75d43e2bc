// The built-in HTTP client on POSIX: libcurl with OpenSSL, one background thread per transfer.
//
// Certificates: libcurl verifies the chain against the system's roots plus the roots of the
// trust store file and of ICAddTrustedRoot (added to the OpenSSL store from the SSL_CTX
// callback), checks dates and the host name, and fails the handshake otherwise. The certificate
// callback runs from CURLOPT_PREREQFUNCTION: after the handshake, before the first byte of the
// request is written, with the chain from SSL_get0_verified_chain.
#include "platform/oehttpclient.h"

#include "foundation/oememory.h"
#include "platform/internal/oehttpclientbase.h"

#include <curl/curl.h>
#include <openssl/evp.h>
#include <openssl/ssl.h>
#include <openssl/x509.h>
#include <openssl/x509_vfy.h>

#include <atomic>
#include <cerrno>
#include <dlfcn.h>
#include <sys/stat.h>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <mutex>
#include <string>
#include <thread>
#include <unistd.h>
#include <vector>

namespace OEPlatform {

int DecodeCertificate(const unsigned char* bytes, unsigned long length, unsigned char** der,
                      unsigned long* derLength, char sha1Hex[41]) {
    *der = nullptr;
    *derLength = 0;
    sha1Hex[0] = '\0';
    const unsigned char* p = bytes;
    X509* x = d2i_X509(nullptr, &p, static_cast<long>(length));
    if (!x) return 0;
    int n = i2d_X509(x, nullptr);
    int ok = 0;
    if (n > 0) {
        unsigned char* out = static_cast<unsigned char*>(OEMemory::Malloc(static_cast<std::size_t>(n)));
        unsigned char* q = out;
        unsigned char md[EVP_MAX_MD_SIZE];
        unsigned mdLength = 0;
        if (out && i2d_X509(x, &q) == n &&
            EVP_Digest(out, static_cast<std::size_t>(n), md, &mdLength, EVP_sha1(), nullptr)) {
            HexOf(md, mdLength, sha1Hex);
            *der = out;
            *derLength = static_cast<unsigned long>(n);
            ok = 1;
        } else {
            OEMemory::Free(out);
        }
    }
    X509_free(x);
    return ok;
}

} // namespace OEPlatform

namespace {

using OEPlatform::ICRequestBase;
using OEPlatform::ICRoot;
using OEPlatform::ICSessionBase;

struct Request : ICRequestBase {
    std::string trustFile;
    long rejection = 0;
    CURL* easy = nullptr;
    unsigned long lastProgress[5] = {0, 0, 0, 0, 0};
    std::string agent;
};

struct Session : ICSessionBase {
    std::string agent;
};

size_t WriteToFile(char* data, size_t size, size_t count, void* file) {
    return std::fwrite(data, size, count, static_cast<std::FILE*>(file)) * size;
}

int Progress(void* user, curl_off_t dlTotal, curl_off_t dlNow, curl_off_t ulTotal, curl_off_t ulNow) {
    Request* r = static_cast<Request*>(user);
    if (r->cancelled.load()) return 1;
    ICCallbackData d{};
    if (dlNow > 0) {
        d.value[0] = kICProgressReceiving;
        d.value[1] = static_cast<unsigned long>(dlNow);
        d.value[3] = static_cast<unsigned long>(dlTotal);
    } else if (ulNow > 0 || ulTotal > 0) {
        d.value[0] = kICProgressSending;
        d.value[2] = static_cast<unsigned long>(ulNow);
        d.value[4] = static_cast<unsigned long>(ulTotal);
    } else {
        d.value[0] = kICProgressConnecting;
    }
    if (std::memcmp(d.value, r->lastProgress, sizeof d.value) != 0) {
        std::memcpy(r->lastProgress, d.value, sizeof d.value);
        if (r->callback) r->callback(kICStatusProgress, &d, r->context);
    }
    return 0;
}

CURLcode AddRoots(CURL*, void* sslContext, void* user) {
    Request* r = static_cast<Request*>(user);
    X509_STORE* store = SSL_CTX_get_cert_store(static_cast<SSL_CTX*>(sslContext));
    if (!r->trustFile.empty() && X509_STORE_load_file(store, r->trustFile.c_str()) != 1)
        return CURLE_SSL_CACERT_BADFILE;
    for (const ICRoot& root : r->roots) {
        const unsigned char* p = root.der.data();
        X509* x = d2i_X509(nullptr, &p, static_cast<long>(root.der.size()));
        if (!x) return CURLE_SSL_CERTPROBLEM;
        X509_STORE_add_cert(store, x); // an already present root is no error
        X509_free(x);
    }
    return CURLE_OK;
}

// After the handshake, before the request: hand the verified chain to the certificate callback.
int BeforeRequest(void* user, char*, char*, int, int) {
    Request* r = static_cast<Request*>(user);
    if (r->cancelled.load()) return CURL_PREREQFUNC_ABORT;
    const curl_tlssessioninfo* info = nullptr;
    if (curl_easy_getinfo(r->easy, CURLINFO_TLS_SSL_PTR, &info) != CURLE_OK || !info || !info->internals)
        return CURL_PREREQFUNC_OK; // plain HTTP: no certificates
    if (!r->certCallback) return CURL_PREREQFUNC_OK;
    SSL* ssl = static_cast<SSL*>(info->internals);
    STACK_OF(X509)* chain = SSL_get0_verified_chain(ssl);
    if (!chain || sk_X509_num(chain) == 0) chain = SSL_get_peer_cert_chain(ssl); // verification off
    int count = chain ? sk_X509_num(chain) : 0;
    std::vector<std::vector<unsigned char>> ders;
    for (int i = count - 1; i >= 0; --i) { // root first
        X509* x = sk_X509_value(chain, i);
        int n = i2d_X509(x, nullptr);
        std::vector<unsigned char> der(n > 0 ? static_cast<size_t>(n) : 0);
        unsigned char* q = der.data();
        if (n > 0) i2d_X509(x, &q);
        ders.push_back(std::move(der));
    }
    short rootId = 0;
    if (!ders.empty() && SSL_get_verify_result(ssl) == X509_V_OK && SSL_get0_verified_chain(ssl))
        for (const ICRoot& root : r->roots)
            if (root.der == ders.front()) {
                rootId = root.id;
                break;
            }
    std::vector<ICCertificate> certs;
    for (const auto& d : ders) certs.push_back(ICCertificate{d.data(), static_cast<unsigned long>(d.size())});
    long answer = r->certCallback(certs.data(), static_cast<unsigned long>(certs.size()), rootId, 0,
                                  r->certContext, 0, 0);
    if (answer != 0) {
        r->rejection = answer;
        return CURL_PREREQFUNC_ABORT;
    }
    return CURL_PREREQFUNC_OK;
}

unsigned long MapCurlResult(Request* r, CURLcode rc) {
    auto net = [](unsigned long e) { return kICNetworkErrorBase | e; };
    long verify = 0;
    switch (rc) {
    case CURLE_OK: {
        long http = 0;
        curl_easy_getinfo(r->easy, CURLINFO_RESPONSE_CODE, &http);
        if (http >= 200 && http < 300) return 0;
        return kICHttpStatusBase | (static_cast<unsigned long>(http) & 0xFFFFul);
    }
    case CURLE_ABORTED_BY_CALLBACK:
        if (r->rejection) return static_cast<unsigned long>(r->rejection);
        return net(kICErrOperationCancelled);
    case CURLE_OPERATION_TIMEDOUT:
        return net(kICErrTimeout);
    case CURLE_COULDNT_RESOLVE_HOST:
    case CURLE_COULDNT_RESOLVE_PROXY:
        return net(kICErrNameNotResolved);
    case CURLE_COULDNT_CONNECT:
        return net(kICErrCannotConnect);
    case CURLE_PEER_FAILED_VERIFICATION:
    case CURLE_SSL_CONNECT_ERROR:
    case CURLE_SSL_CERTPROBLEM:
    case CURLE_SSL_CIPHER:
    case CURLE_SSL_CACERT_BADFILE:
    case CURLE_SSL_ISSUER_ERROR:
        curl_easy_getinfo(r->easy, CURLINFO_SSL_VERIFYRESULT, &verify);
        if (verify == X509_V_ERR_CERT_HAS_EXPIRED || verify == X509_V_ERR_CERT_NOT_YET_VALID)
            return net(kICErrCertDateInvalid);
        return net(kICErrSecureFailure);
    case CURLE_GOT_NOTHING:
    case CURLE_RECV_ERROR:
    case CURLE_SEND_ERROR:
    case CURLE_PARTIAL_FILE:
        return net(kICErrConnectionAborted);
    default:
        return net(kICErrInternal);
    }
}

// A fresh file in dir for the transfer; its path into path.
std::FILE* MakeTempFile(const std::string& dir, const char* stem, std::string& path) {
    std::string base = dir;
    if (base.empty()) {
        const char* t = std::getenv("TMPDIR");
        base = (t && *t) ? t : "/tmp";
    }
    if (base.back() != '/') base += '/';
    std::string pattern = base + stem + "XXXXXX";
    std::vector<char> name(pattern.begin(), pattern.end());
    name.push_back('\0');
    int fd = mkstemp(name.data());
    if (fd < 0) return nullptr;
    std::FILE* f = fdopen(fd, "wb");
    if (!f) {
        close(fd);
        unlink(name.data());
        return nullptr;
    }
    path = name.data();
    return f;
}

void Perform(Request* r) {
    unsigned long code = 0;
    std::FILE* reply = MakeTempFile(r->tempDir, "oesdk-reply-", r->replyPath);
    std::FILE* headers = reply ? MakeTempFile(r->tempDir, "oesdk-head-", r->headerPath) : nullptr;
    curl_slist* list = nullptr;
    r->easy = (reply && headers) ? curl_easy_init() : nullptr;
    if (!r->easy) {
        code = kICNetworkErrorBase | kICErrInternal;
    } else {
        CURL* h = r->easy;
        curl_easy_setopt(h, CURLOPT_URL, r->url.c_str());
        curl_easy_setopt(h, CURLOPT_PROTOCOLS_STR, "http,https");
        curl_easy_setopt(h, CURLOPT_NOSIGNAL, 1L);
        curl_easy_setopt(h, CURLOPT_CA_CACHE_TIMEOUT, 0L); // the anchors are per request
        if (!r->agent.empty()) curl_easy_setopt(h, CURLOPT_USERAGENT, r->agent.c_str());
        if (r->post) {
            curl_easy_setopt(h, CURLOPT_POST, 1L);
            curl_easy_setopt(h, CURLOPT_POSTFIELDS, r->body.data());
            curl_easy_setopt(h, CURLOPT_POSTFIELDSIZE_LARGE, static_cast<curl_off_t>(r->body.size()));
            // Without ICSetHTTPInfo a POST still goes out as OFX, not as a form.
            std::string type = "Content-Type: " +
                               (r->contentType.empty() ? std::string("application/x-ofx") : r->contentType);
            list = curl_slist_append(list, type.c_str());
            list = curl_slist_append(list, "Expect:");
        }
        if (r->noCache) {
            list = curl_slist_append(list, "Cache-Control: no-cache");
            list = curl_slist_append(list, "Pragma: no-cache");
        }
        size_t start = 0;
        while (start < r->extraHeaders.size()) {
            size_t end = r->extraHeaders.find('\n', start);
            if (end == std::string::npos) end = r->extraHeaders.size();
            std::string line = r->extraHeaders.substr(start, end - start);
            while (!line.empty() && (line.back() == '\r' || line.back() == ' ')) line.pop_back();
            if (!line.empty()) list = curl_slist_append(list, line.c_str());
            start = end + 1;
        }
        if (list) curl_easy_setopt(h, CURLOPT_HTTPHEADER, list);
        curl_easy_setopt(h, CURLOPT_WRITEFUNCTION, WriteToFile);
        curl_easy_setopt(h, CURLOPT_WRITEDATA, reply);
        curl_easy_setopt(h, CURLOPT_HEADERFUNCTION, WriteToFile);
        curl_easy_setopt(h, CURLOPT_HEADERDATA, headers);
        curl_easy_setopt(h, CURLOPT_NOPROGRESS, 0L);
        curl_easy_setopt(h, CURLOPT_XFERINFOFUNCTION, Progress);
        curl_easy_setopt(h, CURLOPT_XFERINFODATA, r);
        curl_easy_setopt(h, CURLOPT_CONNECTTIMEOUT, 30L);
        if (r->timeout > 0) {
            curl_easy_setopt(h, CURLOPT_TIMEOUT, r->timeout);
        } else { // no overall limit, but a stalled transfer ends after two minutes
            curl_easy_setopt(h, CURLOPT_LOW_SPEED_LIMIT, 1L);
            curl_easy_setopt(h, CURLOPT_LOW_SPEED_TIME, 120L);
        }
        curl_easy_setopt(h, CURLOPT_SSLVERSION, static_cast<long>(CURL_SSLVERSION_TLSv1_2));
        curl_easy_setopt(h, CURLOPT_SSL_VERIFYPEER, r->ignoreErrors ? 0L : 1L);
        curl_easy_setopt(h, CURLOPT_SSL_VERIFYHOST, r->ignoreErrors ? 0L : 2L);
        curl_easy_setopt(h, CURLOPT_SSL_CTX_FUNCTION, AddRoots);
        curl_easy_setopt(h, CURLOPT_SSL_CTX_DATA, r);
        curl_easy_setopt(h, CURLOPT_PREREQFUNCTION, BeforeRequest);
        curl_easy_setopt(h, CURLOPT_PREREQDATA, r);
        CURLcode rc = r->cancelled.load() ? CURLE_ABORTED_BY_CALLBACK : curl_easy_perform(h);
        code = MapCurlResult(r, rc);
    }
    if (reply) std::fclose(reply);
    if (headers) std::fclose(headers);
    if (list) curl_slist_free_all(list);
    if (r->easy) curl_easy_cleanup(r->easy);
    r->easy = nullptr;
    r->Finish(code);
}

class CurlClient : public OEPlatform::OEHttpClientBase {
public:
    CurlClient() { curl_global_init(CURL_GLOBAL_DEFAULT); }

    long ICNeedsInternetSetup() override { return 0; }

    ICSession ICOpenInet(long* error, const char* agentName) override {
        Session* s = new (std::nothrow) Session;
        if (error) *error = s ? 0 : kICNetworkErrorBase | kICErrInternal;
        if (s && agentName) s->agent = agentName;
        return static_cast<ICSessionBase*>(s);
    }

    long ICConnect(long) override { return 0; }

    long ICCloseInet(ICSession session) override {
        ICSessionBase* s = static_cast<ICSessionBase*>(session);
        if (!s) return kICNetworkErrorBase | 12018;
        EndSession(*s);
        delete s;
        return 0;
    }

    long ICSetTrustStoreFile(const char* pemFile) override {
        if (pemFile && access(pemFile, R_OK) != 0) return 2;
        std::lock_guard<std::mutex> guard(m_lock);
        m_trustFile = pemFile ? pemFile : "";
        return 0;
    }

protected:
    std::shared_ptr<ICRequestBase> NewRequest(ICSessionBase& s) override {
        std::shared_ptr<Request> r(new (std::nothrow) Request);
        if (r) r->agent = static_cast<Session&>(s).agent;
        return r;
    }

    void TakeTrustStore(ICRequestBase& r) override { static_cast<Request&>(r).trustFile = m_trustFile; }

    void Run(std::shared_ptr<ICRequestBase> r) override { Perform(static_cast<Request*>(r.get())); }

private:
    std::string m_trustFile; // guarded by m_lock
};

} // namespace

OEHttpClient* OEHttpClient::GetDefault() {
    static CurlClient client;
    return &client;
}

namespace OEPlatform {

int TempDirForModule(void* moduleInstance, char* out, std::size_t size) {
    if (!out || size == 0) return 0;
    out[0] = '\0';
    const char* t = std::getenv("TMPDIR");
    std::string base = (t && *t) ? t : "/tmp";
    while (base.size() > 1 && base.back() == '/') base.pop_back();
    // The module: a handle is any address inside it; none means the running program.
    std::string file;
    Dl_info info;
    if (moduleInstance && dladdr(moduleInstance, &info) && info.dli_fname) {
        file = info.dli_fname;
    } else {
        char self[4096];
        ssize_t n = readlink("/proc/self/exe", self, sizeof self - 1);
        if (n > 0) file.assign(self, static_cast<size_t>(n));
    }
    std::string stem = file.substr(file.find_last_of('/') + 1);
    stem = stem.substr(0, stem.find('.'));
    std::string dir = base;
    if (!stem.empty()) {
        std::string candidate = base + "/" + stem + "-tmp";
        if (mkdir(candidate.c_str(), 0700) == 0 || errno == EEXIST) {
            // Replies land there: only a private folder of ours will do, not one someone else
            // made (or linked) in the shared temporary directory.
            struct stat st;
            if (lstat(candidate.c_str(), &st) == 0 && S_ISDIR(st.st_mode) && st.st_uid == geteuid() &&
                (st.st_mode & 077) == 0)
                dir = candidate;
        }
    }
    if (dir.size() + 1 > size) return 0;
    std::memcpy(out, dir.c_str(), dir.size() + 1);
    return 1;
}

} // namespace OEPlatform
