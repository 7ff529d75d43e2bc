#include "foundation/oestring.h"

#include "foundation/oememory.h"

#include <cctype>
#include <cstring>

namespace {
const char kCdataOpen[] = "<![CDATA[";
const unsigned short kCdataOpenLength = 9;
const unsigned short kCdataCloseLength = 3;

// A copy of n bytes as a few overlapping word moves when n is small (most field values are), so
// that it costs no call; longer texts go to memcpy. Reads and writes stay inside the n bytes.
inline void CopyBytes(char* to, const char* from, std::size_t n) {
    if (n >= 16 && n <= 32) {
        std::memcpy(to, from, 16);
        std::memcpy(to + n - 16, from + n - 16, 16);
    } else if (n > 32 && n <= 64) {
        std::memcpy(to, from, 32);
        std::memcpy(to + n - 32, from + n - 32, 32);
    } else if (n >= 8 && n < 16) {
        std::memcpy(to, from, 8);
        std::memcpy(to + n - 8, from + n - 8, 8);
    } else if (n >= 4 && n < 8) {
        std::memcpy(to, from, 4);
        std::memcpy(to + n - 4, from + n - 4, 4);
    } else if (n < 4) {
        for (std::size_t i = 0; i < n; ++i) to[i] = from[i];
    } else {
        std::memcpy(to, from, n);
    }
}

unsigned short ClampedLength(const char* text) {
    size_t n = std::strlen(text);
    return n > OEString::kMaxLength ? static_cast<unsigned short>(OEString::kMaxLength)
                                    : static_cast<unsigned short>(n);
}
} // namespace

OEString::OEString(const char* text) : OEString() {
    CopyString(text);
}

OEString::OEString(const char* text, unsigned short length) : OEString() {
    Assign(text, length);
}

OEString::OEString(const OEString& other) : OEString() {
    if (other.m_length) CopyText(other.m_buffer, other.m_length);
    m_encoding = other.m_encoding;
    m_specLength = other.m_specLength;
}

OEString::OEString(OEString&& other) noexcept
    : m_specLength(other.m_specLength), m_buffer(other.m_buffer), m_bufferSize(other.m_bufferSize),
      m_length(other.m_length), m_encoding(other.m_encoding) {
    other.m_buffer = nullptr;
    other.m_bufferSize = 0;
    other.m_length = 0;
}

OEString::~OEString() {
    FreeBuffer();
}

void OEString::FreeBuffer() {
    OEMemory::PoolFree(m_buffer);
    m_buffer = nullptr;
    m_bufferSize = 0;
    m_length = 0;
}

// Buffers come from the block pool: a string's buffer is small, short-lived and one of many.
// Growing moves the text into a block of exactly the new size, as a reallocation would.
unsigned short OEString::GrowBuffer(unsigned short size, bool zeroFirst) {
    char* grown = static_cast<char*>(OEMemory::PoolAllocBytes(size));
    if (!grown) {
        FreeBuffer();
        return 0;
    }
    if (m_buffer) {
        std::memcpy(grown, m_buffer, m_bufferSize);
        OEMemory::PoolFree(m_buffer);
    } else if (zeroFirst) {
        std::memset(grown, 0, size);
    }
    m_buffer = grown;
    m_bufferSize = size;
    return 1;
}

unsigned short OEString::AllocStringBuffer(unsigned short size) {
    if (size <= m_bufferSize) return 1;
    return GrowBuffer(size, true);
}

unsigned short OEString::CopyString(const char* text) {
    if (!text || !*text) {
        FreeBuffer();
        m_specLength = kUnlimited;
        return 1;
    }
    return Assign(text, ClampedLength(text));
}

unsigned short OEString::Assign(const char* text, unsigned short length) {
    if (!text) length = 0;
    const void* nul = length ? std::memchr(text, 0, length) : nullptr;
    if (nul) length = static_cast<unsigned short>(static_cast<const char*>(nul) - text);
    if (length > kMaxLength) length = kMaxLength;
    if (length == 0) {
        if (m_buffer) {
            m_buffer[0] = 0;
            m_length = 0;
        }
        return 1;
    }
    // The source may live inside our own buffer (self-assignment of a slice).
    if (m_buffer && text >= m_buffer && text < m_buffer + m_bufferSize) {
        std::memmove(m_buffer, text, length);
        m_buffer[length] = 0;
        m_length = length;
        return 1;
    }
    return CopyText(text, length);
}

// The copy-in of `length` bytes (1 to kMaxLength) that hold no NUL and do not lie in our buffer.
// A first buffer is filled whole by the copy, so it is taken without zero-filling.
unsigned short OEString::CopyText(const char* text, unsigned short length) {
    const unsigned short size = static_cast<unsigned short>(length + 1);
    if (size > m_bufferSize && !GrowBuffer(size, false)) return 0;
    CopyBytes(m_buffer, text, length);
    m_buffer[length] = 0;
    m_length = length;
    return 1;
}

OEString& OEString::operator=(const OEString& other) {
    if (this == &other) return *this;
    if (other.m_length == 0) {
        FreeBuffer();
    } else {
        // Another string's text holds no NUL and is never inside our buffer.
        CopyText(other.m_buffer, other.m_length);
    }
    m_encoding = other.m_encoding;
    m_specLength = other.m_specLength;
    return *this;
}

unsigned short OEString::AssignText(const OEString& other) {
    if (this == &other) return 1;
    m_encoding = other.m_encoding;
    if (other.m_length == 0) {
        FreeBuffer();
        return 1;
    }
    return CopyText(other.m_buffer, other.m_length);
}

OEString& OEString::operator=(OEString&& other) noexcept {
    if (this == &other) return *this;
    FreeBuffer();
    m_specLength = other.m_specLength;
    m_buffer = other.m_buffer;
    m_bufferSize = other.m_bufferSize;
    m_length = other.m_length;
    m_encoding = other.m_encoding;
    other.m_buffer = nullptr;
    other.m_bufferSize = 0;
    other.m_length = 0;
    return *this;
}

OEString& OEString::operator=(const char* text) {
    if (text && m_buffer && text >= m_buffer && text < m_buffer + m_bufferSize) {
        Assign(text, ClampedLength(text));
        if (m_length == 0) CopyString(nullptr);
        return *this;
    }
    CopyString(text);
    return *this;
}

OEString& OEString::operator+=(const char* text) {
    if (!text || !*text) return *this;
    size_t add = std::strlen(text);
    if (add > static_cast<size_t>(kMaxLength - m_length)) add = kMaxLength - m_length;
    if (add == 0) return *this;
    unsigned short newLength = static_cast<unsigned short>(m_length + add);
    // Appending a piece of ourselves: remember where it sits before the buffer moves.
    ptrdiff_t selfOffset = -1;
    if (m_buffer && text >= m_buffer && text < m_buffer + m_bufferSize) selfOffset = text - m_buffer;
    if (!AllocStringBuffer(static_cast<unsigned short>(newLength + 1))) return *this;
    const char* src = selfOffset >= 0 ? m_buffer + selfOffset : text;
    std::memmove(m_buffer + m_length, src, add);
    m_buffer[newLength] = 0;
    m_length = newLength;
    return *this;
}

OEString& OEString::operator+=(char c) {
    if (c == 0 || m_length >= kMaxLength) return *this;
    if (!AllocStringBuffer(static_cast<unsigned short>(m_length + 2))) return *this;
    m_buffer[m_length++] = c;
    m_buffer[m_length] = 0;
    return *this;
}

unsigned short OEString::SetMsgSetVersion(unsigned short) {
    return 1;
}

unsigned short OEString::IsValid() const {
    return m_length <= m_specLength ? 1 : 0;
}

void OEString::SetSpecLength(unsigned short specLength) {
    m_specLength = specLength;
}

void OEString::Truncate(unsigned short n) {
    if (!m_buffer || n > m_bufferSize) return;
    if (n < m_length) {
        m_buffer[n] = 0;
        m_length = n;
    }
}

void OEString::TruncateToSpec() {
    Truncate(m_specLength);
}

bool OEString::operator==(const OEString& other) const {
    if (m_length != other.m_length) return false;
    return m_length == 0 || std::memcmp(m_buffer, other.m_buffer, m_length) == 0;
}

bool OEString::operator==(const char* text) const {
    if (!text || !*text) return m_length == 0;
    return std::strcmp(c_str(), text) == 0;
}

int OEString::strcmpi(const char* text) const {
    const unsigned char* a = reinterpret_cast<const unsigned char*>(c_str());
    const unsigned char* b = reinterpret_cast<const unsigned char*>(text ? text : "");
    for (;; ++a, ++b) {
        int ca = std::tolower(*a), cb = std::tolower(*b);
        if (ca != cb) return ca < cb ? -1 : 1;
        if (ca == 0) return 0;
    }
}

char* OEString::LockBuffer(unsigned short size) {
    if (size == 0) size = 1;
    if (!AllocStringBuffer(size)) return nullptr;
    return m_buffer;
}

void OEString::UnlockBuffer() {
    if (!m_buffer) return;
    m_buffer[m_bufferSize - 1] = 0;
    m_length = static_cast<unsigned short>(std::strlen(m_buffer));
}

void OEString::Clear(char c) {
    if (!m_buffer) return;
    std::memset(m_buffer, c, m_bufferSize);
    m_buffer[m_bufferSize - 1] = 0;
    m_length = static_cast<unsigned short>(std::strlen(m_buffer));
}

unsigned short OEString::IsWhiteSpace() const {
    for (unsigned short i = 0; i < m_length; ++i) {
        char c = m_buffer[i];
        if (c != ' ' && c != '\n' && c != '\r' && c != '\t') return 0;
    }
    return 1;
}

void OEString::MakeUpper() {
    for (unsigned short i = 0; i < m_length; ++i)
        m_buffer[i] = static_cast<char>(std::toupper(static_cast<unsigned char>(m_buffer[i])));
}

void OEString::MakeLower() {
    for (unsigned short i = 0; i < m_length; ++i)
        m_buffer[i] = static_cast<char>(std::tolower(static_cast<unsigned char>(m_buffer[i])));
}

void OEString::TrimLeadingSpaces() {
    unsigned short skip = 0;
    while (skip < m_length && m_buffer[skip] == ' ') ++skip;
    if (skip == 0) return;
    std::memmove(m_buffer, m_buffer + skip, m_length - skip + 1u);
    m_length = static_cast<unsigned short>(m_length - skip);
}

void OEString::TrimTrailingSpaces() {
    while (m_length > 0 && m_buffer[m_length - 1] == ' ') m_buffer[--m_length] = 0;
}

void OEString::ToCDATA() {
    if (!(m_length >= kCdataOpenLength && std::memcmp(m_buffer, kCdataOpen, kCdataOpenLength) == 0)) {
        size_t total = static_cast<size_t>(m_length) + kCdataOpenLength + kCdataCloseLength;
        if (total > kMaxLength) return;
        unsigned short length = m_length;
        if (!AllocStringBuffer(static_cast<unsigned short>(total + 1))) return;
        std::memmove(m_buffer + kCdataOpenLength, m_buffer, length);
        std::memcpy(m_buffer, kCdataOpen, kCdataOpenLength);
        std::memcpy(m_buffer + kCdataOpenLength + length, "]]>", kCdataCloseLength);
        m_length = static_cast<unsigned short>(total);
        m_buffer[m_length] = 0;
    }
    m_encoding = OESE_CDATA;
}

void OEString::FromCDATA() {
    if (m_length >= kCdataOpenLength && std::memcmp(m_buffer, kCdataOpen, kCdataOpenLength) == 0) {
        unsigned short inner = static_cast<unsigned short>(m_length - kCdataOpenLength);
        inner = inner >= kCdataCloseLength ? static_cast<unsigned short>(inner - kCdataCloseLength) : 0;
        std::memmove(m_buffer, m_buffer + kCdataOpenLength, inner);
        m_buffer[inner] = 0;
        m_length = inner;
    }
    m_encoding = OESE_PLAIN;
}

OEMultiLenString& OEMultiLenString::operator=(const OEString& other) {
    unsigned short own = m_specLength;
    OEString::operator=(other);
    m_specLength = own;
    return *this;
}
