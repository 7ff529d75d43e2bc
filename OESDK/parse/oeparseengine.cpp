#include "parse/oeparseengine.h"

#include "foundation/oebuffer.h"
#include "foundation/oeparsewarning.h"
#include "parse/oeutility.h"

#include <cstdint>
#include <cstring>

namespace {

inline bool IsSpace(char c) {
    return c == ' ' || c == '\n' || c == '\r' || c == '\t';
}

inline char Upper(char c) {
    return (c >= 'a' && c <= 'z') ? static_cast<char>(c - 'a' + 'A') : c;
}

inline bool EqualsIgnoringCase(const char* a, const char* b, std::size_t n) {
    for (std::size_t i = 0; i < n; ++i)
        if (Upper(a[i]) != Upper(b[i])) return false;
    return true;
}

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
            std::uint32_t slot = Hash(name, length) & kMask;
            while (m_slots[slot]) slot = (slot + 1) & kMask;
            m_slots[slot] = &table[i];
            m_lengths[slot] = static_cast<unsigned short>(length);
        }
    }

    const OETagDictionaryEntry* Find(const char* name, std::size_t length) const {
        std::uint32_t slot = Hash(name, length) & kMask;
        while (const OETagDictionaryEntry* entry = m_slots[slot]) {
            if (m_lengths[slot] == length && std::memcmp(entry->m_name, name, length) == 0) return entry;
            slot = (slot + 1) & kMask;
        }
        return nullptr;
    }

private:
    enum : std::uint32_t { kSize = 4096, kMask = kSize - 1 };

    static std::uint32_t Hash(const char* p, std::size_t n) {
        std::uint32_t h = 2166136261u;
        for (std::size_t i = 0; i < n; ++i) h = (h ^ static_cast<unsigned char>(p[i])) * 16777619u;
        return h ^ (h >> 15);
    }

    const OETagDictionaryEntry* m_slots[kSize];
    unsigned short m_lengths[kSize] = {};
};

const NameIndex& TheNameIndex() {
    static const NameIndex index; // built once, thread-safely
    return index;
}

// The OFX header names (the keyword table of the header conversion), matched ignoring case.
// CONTENT-TYPE and CONTENT-LENGTH have no keyword: they come back as OEHT_UNKNOWN, with their
// name, and so are kept as MIME headers.
OEHeaderTag HeaderTagOf(const char* name, std::size_t length) {
    static const char* const kNames[] = {"OFXHEADER", "DATA",        "VERSION",    "SECURITY",  "ENCODING",
                                         "CHARSET",   "COMPRESSION", "OLDFILEUID", "NEWFILEUID"};
    for (int i = 0; i < 9; ++i)
        if (std::strlen(kNames[i]) == length && EqualsIgnoringCase(kNames[i], name, length))
            return static_cast<OEHeaderTag>(OEHT_OFXHEADER + i);
    return OEHT_UNKNOWN;
}

void AssignRange(OEString& out, const char* p, std::size_t n) {
    const std::size_t maxLength = OEString::kMaxLength;
    out.Assign(p, static_cast<unsigned short>(n > maxLength ? maxLength : n));
}

} // namespace

OEParseEngine::OEParseEngine(OEBuffer* buffer)
    : m_dictionary(OETagDictionary::TheOETagDictionary()), m_buffer(buffer),
      m_data(buffer ? buffer->GetBufferPtr() : nullptr),
      m_size(buffer && m_data ? buffer->GetBufferSize() : 0), m_haveLookAhead(false), m_pos(0),
      m_headerPos(0), m_piPos(0), m_piEnd(0), m_headersDone(false), m_lastStartEmpty(false) {
    m_current.m_kind = kRawEnd;
    m_lookAhead.m_kind = kRawEnd;
    const void* lt = m_size ? std::memchr(m_data, '<', m_size) : nullptr;
    m_pos = lt ? static_cast<unsigned long>(static_cast<const char*>(lt) - m_data) : m_size;
    TheNameIndex();
}

OEParseEngine::~OEParseEngine() {}

void OEParseEngine::SyncOffset(unsigned long pos) {
    if (m_buffer) m_buffer->SetBufferOffset(pos);
}

void OEParseEngine::LogAt(unsigned long pos, int code, const char* text, unsigned long length, OETagID tag) {
    SyncOffset(pos);
    OEString copy;
    AssignRange(copy, text, length);
    OELogParseWarning(static_cast<OEParseWarning>(code), copy.c_str(), nullptr, tag);
}

const OETagDictionaryEntry* OEParseEngine::ResolveTagName(const char* name, unsigned short length) {
    if (!name || !length) return nullptr;
    if (const OETagDictionaryEntry* entry = TheNameIndex().Find(name, length)) return entry;
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
    if (nameEnd <= nameStart || nameEnd - nameStart > 0xFFFF) {
        token.m_kind = kRawBad;
        token.m_start = lt;
        token.m_length = gt + 1 - lt;
        return;
    }
    token.m_kind = endTag ? kRawEndTag : (selfClosing ? kRawEmpty : kRawStart);
    token.m_start = nameStart;
    token.m_length = nameEnd - nameStart;
}

void OEParseEngine::ScanRaw(RawToken& token) {
    const char* base = m_data;
    unsigned long p = m_pos;
    for (;;) {
        while (p < m_size && IsSpace(base[p])) ++p;
        if (p >= m_size) {
            token.m_kind = kRawEnd;
            token.m_tagStart = token.m_start = token.m_next = m_size;
            token.m_length = 0;
            return;
        }
        if (base[p] != '<') {
            // Text runs to the next "<"; trailing whitespace is not part of it.
            const void* lt = std::memchr(base + p, '<', m_size - p);
            unsigned long end = lt ? static_cast<unsigned long>(static_cast<const char*>(lt) - base) : m_size;
            unsigned long last = end;
            while (last > p && IsSpace(base[last - 1])) --last;
            token.m_kind = kRawText;
            token.m_tagStart = token.m_start = p;
            token.m_length = last - p;
            token.m_next = end;
            return;
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

unsigned short OEParseEngine::ReadText(const RawToken& token) {
    AssignRange(m_value, m_data + token.m_start, token.m_length);
    if (token.m_kind == kRawText && m_value.GetStrLength() &&
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

int OEParseEngine::GetNextToken(const OETagDictionaryEntry*& entry) {
    entry = nullptr;
    m_lastStartEmpty = false;
    for (;;) {
        RawToken token;
        if (m_haveLookAhead) {
            token = m_lookAhead;
            m_haveLookAhead = false;
        } else {
            ScanRaw(token);
        }
        m_current = token;
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
                std::memcmp(name, m_data + m_elementNameStart, nameLength) == 0) {
                entry = m_elementEntry;
                m_elementEntry = nullptr;
                return OETK_ENDTAG;
            }
            m_elementEntry = nullptr;
            entry = ResolveTagName(name, nameLength);
            if (entry) {
                m_unknownElement.Assign("", 0);
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
            const OETagDictionaryEntry* e = ResolveTagName(name, nameLength);
            LogAt(token.m_tagStart, e ? OEPW_EMPTYELEM : OEPW_UNKNOWNTAG, name, nameLength,
                  e ? e->m_id : OETAG_NONE);
            continue;
        }

        default: { // kRawStart: an element when text follows, an aggregate when a tag does
            RawToken next;
            ScanRaw(next);
            if (next.m_kind == kRawText || next.m_kind == kRawCData) {
                m_pos = next.m_next;
                entry = ResolveTagName(name, nameLength);
                if (!entry) {
                    LogAt(token.m_tagStart, OEPW_UNKNOWNTAG, name, nameLength);
                    AssignRange(m_unknownElement, name, nameLength);
                    continue;
                }
                m_unknownElement.Assign("", 0);
                m_elementEntry = entry;
                m_elementNameStart = token.m_start;
                m_elementNameLength = nameLength;
                if (!ReadText(next)) return OETK_ERROR;
                return OETK_ELEMENT;
            }
            m_elementEntry = nullptr;
            m_lookAhead = next;
            m_haveLookAhead = true;
            m_lastStartEmpty = next.m_kind == kRawEndTag && next.m_length == token.m_length &&
                               EqualsIgnoringCase(m_data + next.m_start, name, nameLength);
            entry = ResolveTagName(name, nameLength);
            m_unknownElement.Assign("", 0);
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
    LogAt(m_current.m_tagStart, OEPW_SKIPFAILED, name ? name : "", length);
    return 0;
}
