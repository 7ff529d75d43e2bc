#include "parse/oeparseengine.h"

#include "foundation/oebuffer.h"
#include "foundation/oedataconv.h"
#include "foundation/oeparsewarning.h"
#include "parse/oeutility.h"

#include <cstdint>
#include <cstring>
#include <initializer_list>

#if defined(__SSE2__)
#include <emmintrin.h>
#define OESDK_SCAN_SSE2 1
#endif

namespace {

inline bool IsSpace(char c) {
    return c == ' ' || c == '\n' || c == '\r' || c == '\t';
}

inline char Upper(char c) {
    return (c >= 'a' && c <= 'z') ? static_cast<char>(c - 'a' + 'A') : c;
}

inline bool SameBytes(const char* a, const char* b, std::size_t n) {
    for (std::size_t i = 0; i < n; ++i)
        if (a[i] != b[i]) return false;
    return true;
}

// "</NAME>" at `at` of the `size` bytes at `data`, NAME being the `length` bytes of `name`.
inline bool EndTagAt(const char* data, unsigned long size, unsigned long at, const char* name,
                     unsigned short length) {
    return at + 3 + length <= size && data[at] == '<' && data[at + 1] == '/' &&
           SameBytes(data + at + 2, name, length) && data[at + 2 + length] == '>';
}

inline bool EqualsIgnoringCase(const char* a, const char* b, std::size_t n) {
    for (std::size_t i = 0; i < n; ++i)
        if (Upper(a[i]) != Upper(b[i])) return false;
    return true;
}

// Word-at-a-time helpers (the library targets little-endian x86-64 only).
inline std::uint64_t Load8(const char* p) {
    std::uint64_t w;
    std::memcpy(&w, p, 8);
    return w;
}
const std::uint64_t kOnes = 0x0101010101010101ull;
const std::uint64_t kHighs = 0x8080808080808080ull;
// High bit set in the bytes of w equal to c; the lowest set byte is always a true match.
inline std::uint64_t BytesEqual(std::uint64_t w, unsigned char c) {
    const std::uint64_t x = w ^ (kOnes * c);
    return (x - kOnes) & ~x & kHighs;
}
inline unsigned FirstByte(std::uint64_t mask) {
    return static_cast<unsigned>(__builtin_ctzll(mask)) >> 3;
}

// Characters that end a tag name in the scanner's fast path.
struct NameStopTable {
    bool m_stop[256];
    NameStopTable() : m_stop{} {
        for (unsigned char c : {'>', '<', '/', ' ', '\n', '\r', '\t'}) m_stop[c] = true;
    }
};
const NameStopTable kNameStop;

// A tag name reduced to two words and its length: its first 8 bytes (zero-padded) and its last 8
// bytes (0 for names of up to 8). Names of up to 16 bytes are equal exactly when their keys are.
struct NameKey {
    std::uint64_t m_first;
    std::uint64_t m_last;
    std::size_t m_length;

    // `canOverRead`: 8 bytes from `name` may be read even when the name is shorter.
    NameKey(const char* name, std::size_t length, bool canOverRead)
        : m_first(0), m_last(0), m_length(length) {
        if (length >= 8) {
            m_first = Load8(name);
            m_last = Load8(name + length - 8);
        } else if (canOverRead) {
            m_first = Load8(name) & ((std::uint64_t(1) << (8 * length)) - 1);
        } else {
            for (std::size_t i = 0; i < length; ++i)
                m_first |= std::uint64_t(static_cast<unsigned char>(name[i])) << (8 * i);
        }
    }
    std::uint32_t Hash() const {
        std::uint64_t h = (m_first * 0x9E3779B97F4A7C15ull) ^ (m_last * 0xC2B2AE3D27D4EB4Full) ^ m_length;
        return static_cast<std::uint32_t>(h >> 32) ^ static_cast<std::uint32_t>(h);
    }
};

// Exact-name index over the built-in tag table: one hash probe per tag instead of a binary
// search through the dictionary's comparison objects. It answers exactly what the dictionary's
// case-sensitive lookup answers (the names are unique); case-insensitive lookups, which only
// malformed input needs, still go to the dictionary.
class NameIndex {
public:
    NameIndex() : m_slots{} {
        const OETagDictionaryEntry* table = GetOETagDictionary();
        unsigned short count = NumberOfOEDictionaryEntry();
        for (unsigned short i = 0; i < count; ++i) {
            const char* name = table[i].m_name;
            if (!name || !*name) continue;
            std::size_t length = std::strlen(name);
            char padded[80] = {};
            if (length >= sizeof padded - 8) continue; // no such tag: the longest has 37 characters
            std::memcpy(padded, name, length);
            NameKey key(padded, length, true);
            m_allPlain = m_allPlain && IsPlainName(name, length);
            std::uint32_t slot = key.Hash() & kMask;
            while (m_slots[slot].m_entry) slot = (slot + 1) & kMask;
            m_slots[slot] = Slot{&table[i], key.m_first, key.m_last, static_cast<unsigned short>(length)};
        }
    }

    const OETagDictionaryEntry* Find(const char* name, std::size_t length, bool canOverRead) const {
        const NameKey key(name, length, canOverRead);
        for (std::uint32_t slot = key.Hash() & kMask;; slot = (slot + 1) & kMask) {
            const Slot& s = m_slots[slot];
            if (!s.m_entry) return nullptr;
            if (s.m_length == length && s.m_first == key.m_first && s.m_last == key.m_last &&
                (length <= 16 || std::memcmp(s.m_entry->m_name + 8, name + 8, length - 16) == 0))
                return s.m_entry;
        }
    }

    // Every name is a letter followed by letters, digits, "." and "_" (true of the built-in
    // table): a name found here holds nothing that would end a tag name early.
    bool AllPlain() const { return m_allPlain; }

private:
    static bool IsPlainName(const char* name, std::size_t length) {
        for (std::size_t i = 0; i < length; ++i) {
            const char c = name[i];
            const bool letter = (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
            if (!letter && (i == 0 || !((c >= '0' && c <= '9') || c == '.' || c == '_'))) return false;
        }
        return length > 0;
    }

    enum : std::uint32_t { kSize = 4096, kMask = kSize - 1 };
    struct Slot {
        const OETagDictionaryEntry* m_entry;
        std::uint64_t m_first;
        std::uint64_t m_last;
        unsigned short m_length;
    };
    Slot m_slots[kSize];
    bool m_allPlain = true;
};

const NameIndex& TheNameIndex() {
    static const NameIndex index; // built once, thread-safely
    return index;
}

const NameIndex* g_nameIndex = nullptr; // set by every engine's constructor (always the same index)

// The OFX header names are the keywords of the header conversion (OFXHEADER to NEWFILEUID), matched
// ignoring case but, unlike the conversion itself, without logging a miss: CONTENT-TYPE,
// CONTENT-LENGTH and any other name come back as OEHT_UNKNOWN with their name, for the file object
// to keep as MIME headers.
OEHeaderTag HeaderTagOf(const char* name, std::size_t length) {
    for (int t = OEHT_OFXHEADER; t <= OEHT_NEWFILEUID; ++t) {
        OEString keyword;
        if (OEDataConversion::HeaderTagToString(static_cast<OEHeaderTag>(t), keyword) &&
            keyword.GetStrLength() == length && EqualsIgnoringCase(keyword.c_str(), name, length))
            return static_cast<OEHeaderTag>(t);
    }
    return OEHT_UNKNOWN;
}

// A tag name longer than a string can hold is malformed: lookups and log texts carry 16-bit
// lengths, and a cut-down name could otherwise pass for a real tag.
const unsigned long kMaxNameLength = OEString::kMaxLength;

void AssignRange(OEString& out, const char* p, std::size_t n) {
    const std::size_t maxLength = OEString::kMaxLength;
    out.Assign(p, static_cast<unsigned short>(n > maxLength ? maxLength : n));
}

} // namespace

OEParseEngine::OEParseEngine(OEBuffer* buffer)
    : m_dictionary(OETagDictionary::TheOETagDictionary()), m_buffer(buffer),
      m_data(buffer ? buffer->GetBufferPtr() : nullptr),
      m_size(buffer && m_data ? buffer->GetBufferSize() : 0), m_tokenStart(0), m_haveLookAhead(false),
      m_pos(0), m_headerPos(0), m_piPos(0), m_piEnd(0), m_headersDone(false), m_lastStartEmpty(false),
      m_elementNameStart(0), m_elementNameLength(0), m_elementEntry(nullptr) {
    m_lookAhead = RawToken{kRawEnd, 0, 0, 0, 0, -1, false};
    const void* lt = m_size ? std::memchr(m_data, '<', m_size) : nullptr;
    m_pos = lt ? static_cast<unsigned long>(static_cast<const char*>(lt) - m_data) : m_size;
    g_nameIndex = &TheNameIndex();
}

OEParseEngine::~OEParseEngine() {}

inline void OEParseEngine::SyncOffset(unsigned long pos) {
    if (m_buffer) m_buffer->SetBufferOffset(pos);
}

// The element just read takes its own end tag, whose "<" stands at `at`, with it.
inline void OEParseEngine::TakeElementEnd(unsigned long at, unsigned short nameLength) {
    m_pos = at + 3 + nameLength;
    m_elementEntry = nullptr;
    m_elementClosed = true;
}

void OEParseEngine::LogAt(unsigned long pos, int code, const char* text, unsigned long length, OETagID tag) {
    SyncOffset(pos);
    OEString copy;
    AssignRange(copy, text, length);
    OELogParseWarning(static_cast<OEParseWarning>(code), copy.c_str(), nullptr, tag);
}

namespace {
const OETagDictionaryEntry* ResolveSlow(const char* name, unsigned short length);
} // namespace

#if defined(__GNUC__)
#define OE_ALWAYS_INLINE inline __attribute__((always_inline))
#define OE_NOINLINE __attribute__((noinline))
#else
#define OE_ALWAYS_INLINE inline
#define OE_NOINLINE
#endif

OE_ALWAYS_INLINE const OETagDictionaryEntry* OEParseEngine::Resolve(const RawToken& token) {
    const char* name = m_data + token.m_start;
    const unsigned short length = static_cast<unsigned short>(token.m_length);
    if (const OETagDictionaryEntry* entry = g_nameIndex->Find(name, length, token.m_start + 8 <= m_size))
        return entry;
    return ResolveSlow(name, length);
}

const OETagDictionaryEntry* OEParseEngine::ResolveTagName(const char* name, unsigned short length) {
    if (!name || !length) return nullptr;
    if (const OETagDictionaryEntry* entry = TheNameIndex().Find(name, length, false)) return entry;
    return ResolveSlow(name, length);
}

namespace {
// Not found as written: a name with a lower-case letter is looked up again ignoring case.
const OETagDictionaryEntry* ResolveSlow(const char* name, unsigned short length) {
    bool hasLower = false;
    for (unsigned short i = 0; i < length && !hasLower; ++i) hasLower = name[i] >= 'a' && name[i] <= 'z';
    if (!hasLower) return nullptr;
    OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
    if (!dictionary || !dictionary->IsUsable()) return nullptr;
    OETagID id = OETAG_NONE;
    const OETagDictionaryEntry* entry = dictionary->GetTagID(name, length, &id, OECaseInsensitive);
    if (entry) {
        OEString copy(name, length);
        OELogParseWarning(OEPW_LOWERCASE, copy.c_str(), nullptr, entry->m_id);
    }
    return entry;
}
} // namespace

// ---------------------------------------------------------------------------------------------
// Header lines

unsigned short OEParseEngine::NextPiHeader(OEHeaderTag& tag, OEString& name, OEString& value) {
    unsigned long p = m_piPos, end = m_piEnd;
    while (p < end && IsSpace(m_data[p])) ++p;
    unsigned long nameStart = p;
    while (p < end && !IsSpace(m_data[p]) && m_data[p] != '=') ++p;
    unsigned long nameEnd = p;
    while (p < end && IsSpace(m_data[p])) ++p;
    if (nameEnd == nameStart || p >= end || m_data[p] != '=') {
        m_piPos = 0;
        return 0;
    }
    ++p;
    while (p < end && IsSpace(m_data[p])) ++p;
    unsigned long valueStart = p, valueEnd;
    if (p < end && (m_data[p] == '"' || m_data[p] == '\'')) {
        const char quote = m_data[p];
        valueStart = ++p;
        while (p < end && m_data[p] != quote) ++p;
        valueEnd = p;
        if (p < end) ++p;
    } else {
        while (p < end && !IsSpace(m_data[p])) ++p;
        valueEnd = p;
    }
    m_piPos = p;
    AssignRange(name, m_data + nameStart, nameEnd - nameStart);
    AssignRange(value, m_data + valueStart, valueEnd - valueStart);
    tag = HeaderTagOf(m_data + nameStart, nameEnd - nameStart);
    return 1;
}

unsigned short OEParseEngine::GetNextHeader(OEHeaderTag& tag, OEString& name, OEString& value) {
    if (m_headersDone) return 0;
    for (;;) {
        if (m_piPos) {
            if (NextPiHeader(tag, name, value)) return 1;
            continue;
        }
        unsigned long p = m_headerPos;
        while (p < m_size && IsSpace(m_data[p])) ++p;
        if (p < m_size && m_data[p] == '<' && p + 1 < m_size &&
            (m_data[p + 1] == '!' || m_data[p + 1] == '?')) {
            // A declaration or processing instruction in front of the body.
            const void* gt = std::memchr(m_data + p, '>', m_size - p);
            if (gt) {
                unsigned long g = static_cast<unsigned long>(static_cast<const char*>(gt) - m_data);
                if (m_data[p + 1] == '?' && g - p >= 5 && EqualsIgnoringCase(m_data + p + 2, "OFX", 3) &&
                    IsSpace(m_data[p + 5])) {
                    m_piPos = p + 5;
                    m_piEnd = (m_data[g - 1] == '?') ? g - 1 : g;
                }
                m_headerPos = g + 1;
                continue;
            }
        }
        if (p >= m_size || m_data[p] == '<') {
            m_headersDone = true;
            m_headerPos = p;
            m_pos = p;
            return 0;
        }
        // A line ends at a line feed or carriage return; the body's first "<" ends it too.
        unsigned long end = p;
        while (end < m_size && m_data[end] != '\n' && m_data[end] != '\r' && m_data[end] != '<') ++end;
        m_headerPos = (end < m_size && m_data[end] != '<') ? end + 1 : end;
        const void* colon = std::memchr(m_data + p, ':', end - p);
        if (!colon) continue; // not a header line: skipped
        unsigned long c = static_cast<unsigned long>(static_cast<const char*>(colon) - m_data);
        unsigned long nameEnd = c, valueStart = c + 1, valueEnd = end;
        while (nameEnd > p && IsSpace(m_data[nameEnd - 1])) --nameEnd;
        while (valueStart < valueEnd && IsSpace(m_data[valueStart])) ++valueStart;
        while (valueEnd > valueStart && IsSpace(m_data[valueEnd - 1])) --valueEnd;
        AssignRange(name, m_data + p, nameEnd - p);
        AssignRange(value, m_data + valueStart, valueEnd - valueStart);
        tag = HeaderTagOf(m_data + p, nameEnd - p);
        return 1;
    }
}

unsigned short OEParseEngine::SkipBoundaryLine() {
    if (m_haveLookAhead) return 1;
    unsigned long p = m_pos;
    while (p < m_size && IsSpace(m_data[p])) ++p;
    if (p + 1 >= m_size || m_data[p] != '-' || m_data[p + 1] != '-') return 1;
    while (p < m_size && m_data[p] != '\n' && m_data[p] != '\r') ++p;
    if (p >= m_size) return 0;
    m_pos = p + 1;
    return 1;
}

// ---------------------------------------------------------------------------------------------
// Raw scanning

void OEParseEngine::ScanTag(unsigned long lt, RawToken& token) {
    token.m_tagStart = lt;
    const char* base = m_data;
    const void* gtp = std::memchr(base + lt + 1, '>', m_size - lt - 1);
    unsigned long gt = gtp ? static_cast<unsigned long>(static_cast<const char*>(gtp) - base) : m_size;
    // A "<" before the closing ">" means this tag never closed.
    const void* inner = std::memchr(base + lt + 1, '<', gt - lt - 1);
    if (!gtp || inner) {
        unsigned long stop =
            inner ? static_cast<unsigned long>(static_cast<const char*>(inner) - base) : m_size;
        token.m_kind = kRawBad;
        token.m_start = lt;
        token.m_length = stop - lt;
        token.m_next = stop;
        return;
    }
    unsigned long p = lt + 1;
    while (p < gt && IsSpace(base[p])) ++p;
    bool endTag = false;
    if (p < gt && base[p] == '/') {
        endTag = true;
        ++p;
        while (p < gt && IsSpace(base[p])) ++p;
    }
    unsigned long nameStart = p;
    while (p < gt && !IsSpace(base[p])) ++p;
    unsigned long nameEnd = p;
    bool selfClosing = !endTag && gt > lt + 1 && base[gt - 1] == '/';
    if (selfClosing && nameEnd == gt) --nameEnd; // "<MEMO/>"
    token.m_next = gt + 1;
    if (nameEnd <= nameStart || nameEnd - nameStart > kMaxNameLength) {
        token.m_kind = kRawBad;
        token.m_start = lt;
        token.m_length = gt + 1 - lt;
        return;
    }
    token.m_kind = endTag ? kRawEndTag : (selfClosing ? kRawEmpty : kRawStart);
    token.m_start = nameStart;
    token.m_length = nameEnd - nameStart;
}

namespace {
// A text token from p up to the "<" (or the end of the buffer) at `end`, trailing whitespace trimmed.
template <class Token>
inline void FillText(const char* base, unsigned long p, unsigned long end, int kind, Token& token) {
    unsigned long last = end;
    while (last > p && IsSpace(base[last - 1])) --last;
    token.m_kind = kind;
    token.m_tagStart = token.m_start = p;
    token.m_length = last - p;
    token.m_next = end;
}
} // namespace

#ifdef OESDK_SCAN_SSE2
// A plain "<NAME>" or "</NAME>" whose ">" lies within the 16 bytes after the "<" at p (which the
// caller has checked are in the buffer): one load finds the ">" and anything that would end the
// name before it. Fills the token and returns true, or false for any other tag.
OE_ALWAYS_INLINE bool OEParseEngine::ScanShortTag(unsigned long p, RawToken& token) const {
    const char* base = m_data;
    const __m128i v = _mm_loadu_si128(reinterpret_cast<const __m128i*>(base + p + 1));
    const unsigned gt = static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(v, _mm_set1_epi8('>'))));
    if (!gt) return false;
    __m128i stop = _mm_or_si128(_mm_cmpeq_epi8(v, _mm_set1_epi8('<')), _mm_cmpeq_epi8(v, _mm_set1_epi8('/')));
    stop = _mm_or_si128(stop, _mm_cmpeq_epi8(v, _mm_set1_epi8(' ')));
    stop = _mm_or_si128(stop, _mm_cmpeq_epi8(v, _mm_set1_epi8('\n')));
    stop = _mm_or_si128(stop, _mm_cmpeq_epi8(v, _mm_set1_epi8('\r')));
    stop = _mm_or_si128(stop, _mm_cmpeq_epi8(v, _mm_set1_epi8('\t')));
    const unsigned i = static_cast<unsigned>(__builtin_ctz(gt));
    const bool endTag = base[p + 1] == '/';
    const unsigned from = endTag ? 1u : 0u;
    const unsigned before = static_cast<unsigned>(_mm_movemask_epi8(stop)) & ((1u << i) - 1) & ~from;
    const char first = base[p + 1 + from];
    if (before || i <= from || first == '!' || first == '?') return false;
    token.m_kind = endTag ? kRawEndTag : kRawStart;
    token.m_tagStart = p;
    token.m_start = p + 1 + from;
    token.m_length = i - from;
    token.m_next = p + 2 + i;
    token.m_hasAmp = -1;
    token.m_hasNul = false;
    return true;
}
#endif

// The hot path of the scanner: whitespace, a text, or a plain "<NAME>" / "</NAME>" tag.
// Everything else (comments, CDATA, odd or broken tags, short tails) goes to ScanRaw.
OE_ALWAYS_INLINE void OEParseEngine::ScanFast(RawToken& token) {
#ifdef OESDK_SCAN_SSE2
    const char* base = m_data;
    unsigned long p = m_pos;
    while (p < m_size && IsSpace(base[p])) ++p;
    if (p + 17 > m_size) return ScanRaw(token);
    if (base[p] != '<') {
        unsigned long end = p;
        unsigned amp = 0, nul = 0;
        for (;;) {
            if (end + 16 > m_size) return ScanRaw(token);
            const __m128i v = _mm_loadu_si128(reinterpret_cast<const __m128i*>(base + end));
            const unsigned lt =
                static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(v, _mm_set1_epi8('<'))));
            const unsigned am =
                static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(v, _mm_set1_epi8('&'))));
            const unsigned zero =
                static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(v, _mm_setzero_si128())));
            if (lt) {
                const unsigned i = static_cast<unsigned>(__builtin_ctz(lt));
                const unsigned below = (1u << i) - 1;
                amp |= am & below;
                nul |= zero & below;
                end += i;
                break;
            }
            amp |= am;
            nul |= zero;
            end += 16;
        }
        FillText(base, p, end, kRawText, token);
        token.m_hasAmp = amp ? 1 : 0;
        token.m_hasNul = nul != 0;
        return;
    }
    if (ScanShortTag(p, token)) return;
#endif
    ScanRaw(token);
}

void OEParseEngine::ScanRaw(RawToken& token) {
    const char* base = m_data;
    unsigned long p = m_pos;
    token.m_hasAmp = -1;
    token.m_hasNul = true; // not looked at: the copy checks
    for (;;) {
        while (p < m_size && IsSpace(base[p])) ++p;
        if (p >= m_size) {
            token.m_kind = kRawEnd;
            token.m_tagStart = token.m_start = token.m_next = m_size;
            token.m_length = 0;
            return;
        }
        if (base[p] != '<') {
            // Text runs to the next "<"; trailing whitespace is not part of it. Eight bytes at a
            // time, noting on the way whether the text holds an "&" to decode.
            unsigned long end = p;
            signed char amp = 0;
            for (;;) {
#ifdef OESDK_SCAN_SSE2
                if (end + 16 <= m_size) {
                    const __m128i v = _mm_loadu_si128(reinterpret_cast<const __m128i*>(base + end));
                    const unsigned lt =
                        static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(v, _mm_set1_epi8('<'))));
                    const unsigned am =
                        static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(v, _mm_set1_epi8('&'))));
                    if (lt) {
                        const unsigned i = static_cast<unsigned>(__builtin_ctz(lt));
                        if (am & ((1u << i) - 1)) amp = 1;
                        end += i;
                        break;
                    }
                    if (am) amp = 1;
                    end += 16;
                    continue;
                }
#endif
                if (end + 8 > m_size) {
                    while (end < m_size && base[end] != '<') {
                        if (base[end] == '&') amp = 1;
                        ++end;
                    }
                    break;
                }
                const std::uint64_t w = Load8(base + end);
                const std::uint64_t lt = BytesEqual(w, '<');
                const std::uint64_t am = BytesEqual(w, '&');
                if (lt) {
                    const unsigned i = FirstByte(lt);
                    if (am && FirstByte(am) < i) amp = 1;
                    end += i;
                    break;
                }
                if (am) amp = 1;
                end += 8;
            }
            FillText(base, p, end, kRawText, token);
            token.m_hasAmp = amp;
            return;
        }
        {
            // The common tag, "<NAME>" or "</NAME>".
#ifdef OESDK_SCAN_SSE2
            if (p + 17 <= m_size && ScanShortTag(p, token)) return;
#endif
            unsigned long r = p + 1;
            const bool endTag = r < m_size && base[r] == '/';
            if (endTag) ++r;
            const unsigned long nameStart = r;
            if (r < m_size && base[r] != '!' && base[r] != '?') {
                while (r < m_size && !kNameStop.m_stop[static_cast<unsigned char>(base[r])]) ++r;
                if (r < m_size && base[r] == '>' && r > nameStart && r - nameStart <= kMaxNameLength) {
                    token.m_kind = endTag ? kRawEndTag : kRawStart;
                    token.m_tagStart = p;
                    token.m_start = nameStart;
                    token.m_length = r - nameStart;
                    token.m_next = r + 1;
                    return;
                }
            }
        }
        unsigned long q = p + 1;
        while (q < m_size && IsSpace(base[q])) ++q;
        if (q < m_size && base[q] == '!') {
            if (m_size - q >= 8 && EqualsIgnoringCase(base + q + 1, "[CDATA[", 7)) {
                unsigned long start = q + 8, s = start;
                for (;;) {
                    const void* br = s < m_size ? std::memchr(base + s, ']', m_size - s) : nullptr;
                    if (!br) {
                        token.m_kind = kRawBad;
                        token.m_tagStart = token.m_start = p;
                        token.m_length = m_size - p;
                        token.m_next = m_size;
                        return;
                    }
                    unsigned long b = static_cast<unsigned long>(static_cast<const char*>(br) - base);
                    if (b + 2 < m_size && base[b + 1] == ']' && base[b + 2] == '>') {
                        token.m_kind = kRawCData;
                        token.m_tagStart = p;
                        token.m_start = start;
                        token.m_length = b - start;
                        token.m_next = b + 3;
                        return;
                    }
                    s = b + 1;
                }
            }
            // A comment: "<!" + content + ">", the content at least four characters long and
            // beginning and ending with "--". Skipped whole.
            const void* gtp = std::memchr(base + q, '>', m_size - q);
            if (gtp) {
                unsigned long gt = static_cast<unsigned long>(static_cast<const char*>(gtp) - base);
                unsigned long n = gt - (q + 1);
                const char* c = base + q + 1;
                if (n >= 4 && c[0] == '-' && c[1] == '-' && c[n - 2] == '-' && c[n - 1] == '-') {
                    p = gt + 1;
                    continue;
                }
            }
        } else if (q < m_size && base[q] == '?') {
            // A processing instruction ("<?xml ...?>") carries nothing for the tree.
            const void* gtp = std::memchr(base + q, '>', m_size - q);
            if (gtp) {
                p = static_cast<unsigned long>(static_cast<const char*>(gtp) - base) + 1;
                continue;
            }
        }
        ScanTag(p, token);
        return;
    }
}

// ---------------------------------------------------------------------------------------------
// Tokens

inline unsigned short OEParseEngine::ValueText::SetRaw(const char* text, unsigned long n, bool canOverRead) {
    if (n > kMaxLength) n = kMaxLength;
    // At least 32 bytes, so that a short value is copied in one 16-byte move.
    const unsigned long size = n + 1 < 32 ? 32 : n + 1;
    if (size > m_bufferSize && !AllocStringBuffer(static_cast<unsigned short>(size))) return 0;
#ifdef OESDK_SCAN_SSE2
    if (n <= 16 && canOverRead) {
        _mm_storeu_si128(reinterpret_cast<__m128i*>(m_buffer),
                         _mm_loadu_si128(reinterpret_cast<const __m128i*>(text)));
    } else if (n >= 16 && n <= 32) {
        // Two overlapping moves cover 16 to 32 bytes (the buffer holds at least 32).
        const __m128i head = _mm_loadu_si128(reinterpret_cast<const __m128i*>(text));
        const __m128i tail = _mm_loadu_si128(reinterpret_cast<const __m128i*>(text + n - 16));
        _mm_storeu_si128(reinterpret_cast<__m128i*>(m_buffer), head);
        _mm_storeu_si128(reinterpret_cast<__m128i*>(m_buffer + n - 16), tail);
    } else
#endif
        std::memcpy(m_buffer, text, n);
    (void)canOverRead;
    m_buffer[n] = 0;
    m_length = static_cast<unsigned short>(n);
    return 1;
}

OE_ALWAYS_INLINE unsigned short OEParseEngine::ReadText(const RawToken& token) {
    if (token.m_hasNul) {
        AssignRange(m_value, m_data + token.m_start, token.m_length);
    } else if (!m_value.SetRaw(m_data + token.m_start, token.m_length, token.m_start + 16 <= m_size)) {
        return 0;
    }
    if (token.m_kind == kRawText && token.m_hasAmp != 0 && m_value.GetStrLength() &&
        std::memchr(m_value.c_str(), '&', m_value.GetStrLength())) {
        unsigned short length = m_value.GetStrLength();
        char* p = m_value.LockBuffer(m_value.BufferSize());
        if (!p) return 0;
        unsigned long decoded = OEUtility::DecodeMacros(p, length);
        p[decoded] = 0;
        m_value.UnlockBuffer();
    }
    m_value.SetEncoding(token.m_kind == kRawCData ? OESE_CDATA : OESE_PLAIN);
    return 1;
}

#ifdef OESDK_SCAN_SSE2
namespace {
inline __m128i Load16(const char* p) {
    return _mm_loadu_si128(reinterpret_cast<const __m128i*>(p));
}
inline unsigned MaskOf(__m128i v, char c) {
    return static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(v, _mm_set1_epi8(c))));
}
inline unsigned SpaceMask(__m128i v) {
    const __m128i s = _mm_or_si128(
        _mm_or_si128(_mm_cmpeq_epi8(v, _mm_set1_epi8(' ')), _mm_cmpeq_epi8(v, _mm_set1_epi8('\n'))),
        _mm_or_si128(_mm_cmpeq_epi8(v, _mm_set1_epi8('\r')), _mm_cmpeq_epi8(v, _mm_set1_epi8('\t'))));
    return static_cast<unsigned>(_mm_movemask_epi8(s));
}
// Bytes that never stand in a plain tag name: controls and space, "<", "/", and (as the signed
// compare has it) every byte from 0x80, which the general scanner looks at instead.
inline unsigned NameStopMask(__m128i v) {
    const __m128i low = _mm_cmplt_epi8(v, _mm_set1_epi8(0x21));
    const __m128i marks =
        _mm_or_si128(_mm_cmpeq_epi8(v, _mm_set1_epi8('<')), _mm_cmpeq_epi8(v, _mm_set1_epi8('/')));
    return static_cast<unsigned>(_mm_movemask_epi8(_mm_or_si128(low, marks)));
}
inline bool IsNameStart(char c) {
    const char lower = static_cast<char>(c | 0x20);
    return (lower >= 'a' && lower <= 'z') || (c >= '0' && c <= '9');
}
// n lowest bits set, for n from 0 to 16.
inline unsigned LowBits(unsigned n) {
    return (1u << n) - 1;
}

// "</NAME>" at `at` of the `size` bytes at `data` (where a "<" stands), NAME being the `length`
// bytes of `name`, whose first 16 bytes are `nameBlock`.
inline bool ClosesElement(const char* data, unsigned long size, unsigned long at, __m128i nameBlock,
                          const char* name, unsigned short length) {
    if (at + 18 > size) return EndTagAt(data, size, at, name, length);
    if (data[at + 1] != '/' || data[at + 2 + length] != '>') return false;
    const unsigned same =
        static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(Load16(data + at + 2), nameBlock)));
    return (same & LowBits(length)) == LowBits(length);
}
} // namespace

// The element path in one pass over the bytes. It only takes what it can answer exactly as the
// general path would: names found as written, values without NUL bytes, whitespace runs shorter
// than 16 bytes, and at least 64 bytes of input left; everything else, and every case that logs,
// is left untouched for the general path.
OE_ALWAYS_INLINE int OEParseEngine::FastToken(const OETagDictionaryEntry*& entry) {
    const char* base = m_data;
    unsigned long p = m_pos;
    if (p + 80 > m_size) return kNotFast;
    if (base[p] != '<') { // after an element's value the scan already stands at the "<"
        const __m128i v = Load16(base + p);
        const unsigned lt = MaskOf(v, '<');
        if (!lt) return kNotFast;
        const unsigned i = static_cast<unsigned>(__builtin_ctz(lt));
        if ((SpaceMask(v) & LowBits(i)) != LowBits(i)) return kNotFast;
        p += i;
    }
    // "<NAME>" or "</NAME>" with its ">" in the next 16 bytes.
    const __m128i t = Load16(base + p + 1);
    const unsigned gt = MaskOf(t, '>');
    if (!gt) return kNotFast;
    const unsigned g = static_cast<unsigned>(__builtin_ctz(gt));
    const unsigned from = base[p + 1] == '/' ? 1u : 0u;
    // A name the index knows is plain, so when all its names are, checking what the name holds is
    // left to the lookup.
    if (g <= from || (!g_nameIndex->AllPlain() &&
                      ((NameStopMask(t) & LowBits(g) & ~from) || !IsNameStart(base[p + 1 + from]))))
        return kNotFast;
    const unsigned long nameStart = p + 1 + from;
    const unsigned short nameLength = static_cast<unsigned short>(g - from);
    const char* name = base + nameStart;
    const unsigned long after = p + 2 + g; // past the ">", at most p + 17

    if (from) {
        const OETagDictionaryEntry* e = m_elementEntry;
        if (!e || nameLength != m_elementNameLength ||
            !SameBytes(name, base + m_elementNameStart, nameLength)) {
            e = g_nameIndex->Find(name, nameLength, true);
            if (!e) return kNotFast;
            if (!m_unknownElement.IsEmpty()) m_unknownElement.Assign("", 0);
        }
        m_elementEntry = nullptr;
        m_tokenStart = p;
        SyncOffset(p);
        m_pos = after;
        entry = e;
        return OETK_ENDTAG;
    }

    const OETagDictionaryEntry* e = g_nameIndex->Find(name, nameLength, true);
    if (!e) return kNotFast;
    const char c = base[after];
    if (c == '<' || IsSpace(c)) {
        // A start tag right after (whitespace between): this one opens an aggregate. The next
        // call scans that tag from its "<". End tags ("<MEMO></MEMO>"), comments, CDATA and
        // processing instructions go the general way.
        const __m128i w = Load16(base + after);
        const unsigned lt = MaskOf(w, '<');
        if (!lt) return kNotFast;
        const unsigned k = static_cast<unsigned>(__builtin_ctz(lt));
        if ((SpaceMask(w) & LowBits(k)) != LowBits(k) || !IsNameStart(base[after + k + 1])) return kNotFast;
        m_elementEntry = nullptr;
        if (!m_unknownElement.IsEmpty()) m_unknownElement.Assign("", 0);
        m_tokenStart = p;
        SyncOffset(p);
        m_pos = after + k;
        entry = e;
        return OETK_AGGSTART;
    }

    // An element: its value runs to the next "<", trailing whitespace not part of it.
    unsigned long end = after;
    unsigned amp = 0, nul = 0;
    for (;;) {
        if (end + 16 > m_size) return kNotFast;
        const __m128i v = Load16(base + end);
        const unsigned lt = MaskOf(v, '<');
        const unsigned am = MaskOf(v, '&');
        const unsigned zero =
            static_cast<unsigned>(_mm_movemask_epi8(_mm_cmpeq_epi8(v, _mm_setzero_si128())));
        if (lt) {
            const unsigned i = static_cast<unsigned>(__builtin_ctz(lt));
            amp |= am & LowBits(i);
            nul |= zero & LowBits(i);
            end += i;
            break;
        }
        amp |= am;
        nul |= zero;
        end += 16;
    }
    if (nul || end - after > OEString::kMaxLength) return kNotFast;
    unsigned long last = end;
    while (IsSpace(base[last - 1])) --last; // stops at the value's first byte at the latest
    const unsigned long length = last - after;
    if (!m_value.SetRaw(base + after, length, true)) return kNotFast;
    if (amp) {
        char* text = m_value.LockBuffer(m_value.BufferSize());
        if (!text) return kNotFast;
        const unsigned long decoded = OEUtility::DecodeMacros(text, length);
        text[decoded] = 0;
        m_value.UnlockBuffer();
    }
    m_value.SetEncoding(OESE_PLAIN);
    if (!m_unknownElement.IsEmpty()) m_unknownElement.Assign("", 0);
    m_tokenStart = p;
    SyncOffset(p);
    m_pos = end;
    entry = e;
    // "</NAME>" with the very bytes of the start tag's name, right after the value.
    if (m_skipElementEnd && ClosesElement(base, m_size, end, t, name, nameLength)) {
        TakeElementEnd(end, nameLength);
        return OETK_ELEMENT;
    }
    m_elementEntry = e;
    m_elementNameStart = nameStart;
    m_elementNameLength = nameLength;
    return OETK_ELEMENT;
}
#endif

int OEParseEngine::GetNextToken(const OETagDictionaryEntry*& entry) {
    entry = nullptr;
    m_lastStartEmpty = false;
    m_elementClosed = false;
#ifdef OESDK_SCAN_SSE2
    if (!m_haveLookAhead && m_fastScan) {
        const int kind = FastToken(entry);
        if (kind != kNotFast) return kind;
    }
#endif
    return GeneralToken(entry);
}

// Every token the fast path leaves: scanned into raw tokens, with a look-ahead token to tell
// an element from an aggregate.
OE_NOINLINE int OEParseEngine::GeneralToken(const OETagDictionaryEntry*& entry) {
    for (;;) {
        RawToken token;
        if (m_haveLookAhead) {
            token = m_lookAhead;
            m_haveLookAhead = false;
        } else {
            ScanFast(token);
        }
        m_tokenStart = token.m_tagStart;
        m_pos = token.m_next;
        SyncOffset(token.m_tagStart);
        const char* name = m_data + token.m_start;
        const unsigned short nameLength = static_cast<unsigned short>(token.m_length);

        switch (token.m_kind) {
        case kRawEnd:
            return OETK_ENDOFINPUT;

        case kRawText:
        case kRawCData:
            // Text where a tag belongs: the driver decides (it stops).
            AssignRange(m_value, name, token.m_length);
            return OETK_ERROR;

        case kRawBad:
            LogAt(token.m_start, OEPW_BADFORMAT, name, token.m_length);
            AssignRange(m_value, name, token.m_length);
            return OETK_ERROR;

        case kRawEndTag: {
            if (m_elementEntry && nameLength == m_elementNameLength &&
                SameBytes(name, m_data + m_elementNameStart, nameLength)) {
                entry = m_elementEntry;
                m_elementEntry = nullptr;
                return OETK_ENDTAG;
            }
            m_elementEntry = nullptr;
            entry = Resolve(token);
            if (entry) {
                if (!m_unknownElement.IsEmpty()) m_unknownElement.Assign("", 0);
                return OETK_ENDTAG;
            }
            // The end tag of an unknown element was logged with its start tag.
            if (!m_unknownElement.IsEmpty() && m_unknownElement.GetStrLength() == nameLength &&
                EqualsIgnoringCase(m_unknownElement.c_str(), name, nameLength)) {
                m_unknownElement.Assign("", 0);
                continue;
            }
            LogAt(token.m_tagStart, OEPW_UNKNOWNTAG, name, nameLength);
            continue;
        }

        case kRawEmpty: {
            // "<MEMO/>": an element without a value.
            const OETagDictionaryEntry* e = Resolve(token);
            LogAt(token.m_tagStart, e ? OEPW_EMPTYELEM : OEPW_UNKNOWNTAG, name, nameLength,
                  e ? e->m_id : OETAG_NONE);
            continue;
        }

        default: { // kRawStart: an element when text follows, an aggregate when a tag does
            RawToken next;
            ScanFast(next);
            if (next.m_kind == kRawText || next.m_kind == kRawCData) {
                m_pos = next.m_next;
                entry = Resolve(token);
                if (!entry) {
                    LogAt(token.m_tagStart, OEPW_UNKNOWNTAG, name, nameLength);
                    AssignRange(m_unknownElement, name, nameLength);
                    continue;
                }
                if (!m_unknownElement.IsEmpty()) m_unknownElement.Assign("", 0);
                m_elementEntry = entry;
                m_elementNameStart = token.m_start;
                m_elementNameLength = nameLength;
                if (!ReadText(next)) return OETK_ERROR;
                // No string holds more than kMaxLength bytes: the value goes on cut, and logged.
                if (next.m_length > OEString::kMaxLength)
                    LogAt(token.m_tagStart, OEPW_TOOLONG, name, nameLength, entry->m_id);
                // "</NAME>" with the very bytes of the start tag's name, right after the value:
                // the token the end tag would give is the one the driver passes over.
                const unsigned long at = next.m_next;
                if (m_skipElementEnd && EndTagAt(m_data, m_size, at, name, nameLength))
                    TakeElementEnd(at, nameLength);
                return OETK_ELEMENT;
            }
            m_elementEntry = nullptr;
            m_lookAhead = next;
            m_haveLookAhead = true;
            m_lastStartEmpty = next.m_kind == kRawEndTag && next.m_length == token.m_length &&
                               EqualsIgnoringCase(m_data + next.m_start, name, nameLength);
            entry = Resolve(token);
            if (!m_unknownElement.IsEmpty()) m_unknownElement.Assign("", 0);
            if (entry) return OETK_AGGSTART;
            // An unknown aggregate is skipped whole.
            LogAt(token.m_tagStart, OEPW_UNKNOWNTAG, name, nameLength);
            OEString copy;
            AssignRange(copy, name, nameLength);
            SkipAggregate(copy.c_str());
            m_lastStartEmpty = false;
            continue;
        }
        }
    }
}

unsigned short OEParseEngine::SkipAggregate(const char* name) {
    const std::size_t length = name ? std::strlen(name) : 0;
    unsigned long p = m_haveLookAhead ? m_lookAhead.m_tagStart : m_pos;
    const char* base = m_data;
    while (length && p < m_size) {
        const void* ltp = std::memchr(base + p, '<', m_size - p);
        if (!ltp) break;
        unsigned long lt = static_cast<unsigned long>(static_cast<const char*>(ltp) - base);
        unsigned long q = lt + 1;
        while (q < m_size && IsSpace(base[q])) ++q;
        p = lt + 1;
        if (q >= m_size || base[q] != '/') continue;
        ++q;
        while (q < m_size && IsSpace(base[q])) ++q;
        if (m_size - q < length || !EqualsIgnoringCase(base + q, name, length)) continue;
        q += length;
        if (q < m_size && base[q] != '>' && !IsSpace(base[q])) continue;
        const void* gtp = std::memchr(base + q, '>', m_size - q);
        if (!gtp) break;
        m_pos = static_cast<unsigned long>(static_cast<const char*>(gtp) - base) + 1;
        m_haveLookAhead = false;
        m_lastStartEmpty = false;
        return 1;
    }
    LogAt(m_tokenStart, OEPW_SKIPFAILED, name ? name : "", length);
    return 0;
}
