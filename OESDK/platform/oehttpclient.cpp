// The parts of the HTTP client interface and the certificate object that are the same on every OS.
#include "platform/oehttpclient.h"

#include "foundation/oememory.h"

#include <cstring>
#include <string>

OEHttpClient::~OEHttpClient() {}

long OEHttpClient::ICSetTrustStoreFile(const char*) {
    return 1;
}

namespace {
OEHttpClient* g_hostClient = nullptr;
} // namespace

OEHttpClient* OEHttpClient::GetCurrent() {
    return g_hostClient ? g_hostClient : GetDefault();
}

OEHttpClient* OEHttpClient::SetCurrent(OEHttpClient* client) {
    OEHttpClient* old = g_hostClient;
    g_hostClient = client;
    return old;
}

OECertificate::OECertificate() : m_der(nullptr), m_derLength(0), m_id(0) {
    m_sha1[0] = '\0';
}

OECertificate::~OECertificate() {
    Reset();
}

void OECertificate::Reset() {
    OEMemory::Free(m_der);
    m_der = nullptr;
    m_derLength = 0;
    m_sha1[0] = '\0';
}

namespace {
// Reads the outer tag and length of an encoding. Returns the total size the header announces
// (header + contents), 0 for an indefinite length, or -1 when the header is malformed.
long long OuterSize(const unsigned char* p, unsigned long n) {
    if (n < 2 || p[0] != 0x30) return -1; // a certificate is a SEQUENCE
    unsigned char first = p[1];
    if (first < 0x80) return 2 + static_cast<long long>(first);
    if (first == 0x80) return 0;
    unsigned count = first & 0x7Fu;
    if (count > 4 || n < 2u + count) return -1;
    unsigned long long len = 0;
    for (unsigned i = 0; i < count; ++i) len = (len << 8) | p[2 + i];
    return static_cast<long long>(2 + count + len);
}
} // namespace

// Re-encodes one BER element with definite, minimal lengths (the DER rules for lengths), so
// that a certificate given in BER gets the id of its DER form. Other BER liberties are kept.
class BerToDer {
public:
    BerToDer(const unsigned char* p, std::size_t n) : m_p(p), m_n(n) {}
    // Converts the element at `at`; `at` moves past it. False on malformed input.
    bool Element(std::size_t& at, std::string& out, int depth) {
        if (depth > 64 || at >= m_n) return false;
        std::size_t tagStart = at;
        unsigned char first = m_p[at++];
        if ((first & 0x1F) == 0x1F) { // long tag number
            do {
                if (at >= m_n) return false;
            } while (m_p[at++] & 0x80);
        }
        std::string tag(reinterpret_cast<const char*>(m_p + tagStart), at - tagStart);
        if (at >= m_n) return false;
        unsigned char l = m_p[at++];
        std::string content;
        if (l == 0x80) { // indefinite: constructed contents up to the end-of-contents marker
            if (!(first & 0x20)) return false;
            for (;;) {
                if (at + 2 > m_n) return false;
                if (m_p[at] == 0 && m_p[at + 1] == 0) {
                    at += 2;
                    break;
                }
                if (!Element(at, content, depth + 1)) return false;
            }
        } else {
            std::size_t len = 0;
            if (l < 0x80) {
                len = l;
            } else {
                unsigned count = l & 0x7Fu;
                if (count > 4 || at + count > m_n) return false;
                for (unsigned i = 0; i < count; ++i) len = (len << 8) | m_p[at++];
            }
            if (len > m_n - at) return false;
            if (first & 0x20) {
                std::size_t end = at + len;
                BerToDer inner(m_p, end);
                while (at < end)
                    if (!inner.Element(at, content, depth + 1)) return false;
            } else {
                content.assign(reinterpret_cast<const char*>(m_p + at), len);
                at += len;
            }
        }
        out += tag;
        std::size_t len = content.size();
        if (len < 0x80) {
            out += static_cast<char>(len);
        } else {
            char bytes[8];
            int count = 0;
            for (std::size_t v = len; v; v >>= 8) bytes[count++] = static_cast<char>(v & 0xFF);
            out += static_cast<char>(0x80 | count);
            while (count) out += bytes[--count];
        }
        out += content;
        return true;
    }

private:
    const unsigned char* m_p;
    std::size_t m_n;
};

unsigned short OECertificate::Parse(const unsigned char* bytes, unsigned long length, bool strictDER) {
    Reset();
    if (!bytes || length == 0) return 0;
    long long announced = OuterSize(bytes, length);
    if (announced < 0) return 0;
    if (strictDER && announced != static_cast<long long>(length)) return 0;
    if (!strictDER && announced > static_cast<long long>(length)) return 0;
    std::string der;
    if (!strictDER) {
        std::size_t at = 0;
        if (!BerToDer(bytes, length).Element(at, der, 0) || at != length) return 0;
        bytes = reinterpret_cast<const unsigned char*>(der.data());
        length = static_cast<unsigned long>(der.size());
    }
    if (!OEPlatform::DecodeCertificate(bytes, length, &m_der, &m_derLength, m_sha1)) {
        m_der = nullptr;
        m_derLength = 0;
        m_sha1[0] = '\0';
        return 0;
    }
    return 1;
}

unsigned short OECertificate::ParseDER(const unsigned char* bytes, unsigned long length) {
    return Parse(bytes, length, true);
}

unsigned short OECertificate::ParseBER(const unsigned char* bytes, unsigned long length) {
    return Parse(bytes, length, false);
}

unsigned short OECertificate::GetCertID(char* out, std::size_t size) const {
    if (!out || size == 0) return 0;
    out[0] = '\0';
    if (!m_der || size < sizeof m_sha1) return 0;
    std::memcpy(out, m_sha1, sizeof m_sha1);
    return 1;
}

std::size_t OECertificate::NormalizeID(const char* in, std::size_t length, char* out, std::size_t size) {
    std::size_t n = 0;
    if (!out || size == 0) return 0;
    for (std::size_t i = 0; in && i < length && in[i]; ++i) {
        char c = in[i];
        if (c == ':' || c == ' ') continue;
        if (c >= 'a' && c <= 'z') c = static_cast<char>(c - 'a' + 'A');
        if (n + 1 >= size) break;
        out[n++] = c;
    }
    out[n] = '\0';
    return n;
}
