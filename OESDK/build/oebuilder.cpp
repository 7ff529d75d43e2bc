#include "build/oebuilder.h"

#include "foundation/oethread.h"
#include "parse/oeutility.h"
#include "tags/oedataobj.h"
#include "tags/oetagdictionary.h"

#include <atomic>
#include <cstdint>
#include <cstdio>
#include <cstring>
#if defined(__SSE2__)
#include <emmintrin.h>
#endif
#include <string>
#include <typeinfo>
#include <vector>

const char OEBuilder::OE_NEW_LINE[] = "\n";

namespace {

// Rows 2-4 of the plain table and rows 2-6 of the XML-quote table (never "nbsp": a space is
// never written as an entity).
const char* EntityFor(char c) {
    switch (c) {
    case '>':
        return "&gt;";
    case '<':
        return "&lt;";
    case '&':
        return "&amp;";
    case '"':
        return "&quot;";
    case '\'':
        return "&apos;";
    default:
        return nullptr;
    }
}

// The characters written as entity references: row 0 without, row 1 with the XML quotes.
struct EscapeTable {
    bool m_escape[2][256];
    EscapeTable() : m_escape{} {
        for (int quotes = 0; quotes < 2; ++quotes)
            for (unsigned char c : {'>', '<', '&'}) m_escape[quotes][c] = true;
        m_escape[1][static_cast<unsigned char>('"')] = true;
        m_escape[1][static_cast<unsigned char>('\'')] = true;
    }
};
const EscapeTable kEscape;

inline bool NeedsEscape(char c, bool xmlQuote) {
    return kEscape.m_escape[xmlQuote ? 1 : 0][static_cast<unsigned char>(c)];
}

// The first character of [p, end) to write as an entity reference, or end.
inline const char* FirstToEscape(const char* p, const char* end, bool xmlQuote) {
#if defined(__SSE2__)
    // Sixteen bytes at a time; the last block, or a text of 8 to 15 bytes read as two halves,
    // overlaps bytes already found clean, so that no byte outside [p, end) is ever read.
    const __m128i lt = _mm_set1_epi8('<'), gt = _mm_set1_epi8('>'), amp = _mm_set1_epi8('&');
    const __m128i dq = _mm_set1_epi8(xmlQuote ? '"' : '<'), sq = _mm_set1_epi8(xmlQuote ? '\'' : '<');
    auto hits = [&](__m128i v) {
        __m128i hit = _mm_or_si128(_mm_cmpeq_epi8(v, lt), _mm_cmpeq_epi8(v, gt));
        hit = _mm_or_si128(hit, _mm_cmpeq_epi8(v, amp));
        hit = _mm_or_si128(hit, _mm_or_si128(_mm_cmpeq_epi8(v, dq), _mm_cmpeq_epi8(v, sq)));
        return static_cast<unsigned>(_mm_movemask_epi8(hit));
    };
    if (end - p >= 16) {
        for (; end - p > 16; p += 16)
            if (const unsigned mask = hits(_mm_loadu_si128(reinterpret_cast<const __m128i*>(p))))
                return p + __builtin_ctz(mask);
        const unsigned mask = hits(_mm_loadu_si128(reinterpret_cast<const __m128i*>(end - 16)));
        return mask ? end - 16 + __builtin_ctz(mask) : end;
    }
    if (end - p >= 8) {
        const __m128i low = _mm_loadl_epi64(reinterpret_cast<const __m128i*>(p));
        const __m128i high = _mm_loadl_epi64(reinterpret_cast<const __m128i*>(end - 8));
        const unsigned mask = hits(_mm_unpacklo_epi64(low, high));
        if (mask & 0xFFu) return p + __builtin_ctz(mask);
        return mask ? end - 8 + __builtin_ctz(mask >> 8) : end;
    }
#endif
    while (p < end && !NeedsEscape(*p, xmlQuote)) ++p;
    return p;
}

// Every tag of the dictionary by id, looked up once for the process: the dictionary's name and
// the ready-made texts "<NAME>\n" (whose first n + 2 bytes are the element tag) and "</NAME>\n".
// The texts lie in one block followed by kTagSlack spare bytes, so that a tag can be copied as
// a fixed kTagSlack bytes whatever its length.
enum : unsigned { kTagSlack = 32 };

struct TagName {
    const char* m_text;  // null: no such tag
    const char* m_start; // "<NAME>\n"
    const char* m_end;   // "</NAME>\n"
    unsigned short m_length;
};

struct TagNames {
    std::vector<TagName> m_rows;
    std::vector<char> m_texts;
};

const TagNames& MakeTagNames() {
    static const TagNames names = [] {
        TagNames t;
        OETagDictionary* d = OETagDictionary::TheOETagDictionary();
        unsigned n = NumberOfOEDictionaryEntry();
        t.m_rows.assign(n + 1, TagName{nullptr, nullptr, nullptr, 0});
        std::vector<std::size_t> at(n + 1, 0);
        for (unsigned id = 1; d && id <= n; ++id) {
            const char* name = d->GetTagString(static_cast<OETagID>(id));
            size_t length = name ? std::strlen(name) : 0;
            if (!length || length >= 65535 - 4) continue;
            t.m_rows[id] = TagName{name, nullptr, nullptr, static_cast<unsigned short>(length)};
            at[id] = t.m_texts.size();
            for (const char* open : {"<", "</"}) {
                t.m_texts.insert(t.m_texts.end(), open, open + std::strlen(open));
                t.m_texts.insert(t.m_texts.end(), name, name + length);
                t.m_texts.push_back('>');
                t.m_texts.push_back('\n');
            }
        }
        t.m_texts.resize(t.m_texts.size() + kTagSlack, '\0');
        for (unsigned id = 1; id <= n; ++id) {
            TagName& row = t.m_rows[id];
            if (!row.m_text) continue;
            row.m_start = t.m_texts.data() + at[id];
            row.m_end = row.m_start + row.m_length + 3;
        }
        return t;
    }();
    return names;
}

// Set by every builder's constructor (always the same table), then read without the guard of
// the function-local static.
std::atomic<const TagNames*> g_tagNames{nullptr};

inline const std::vector<TagName>& TagRows() {
    const TagNames* names = g_tagNames.load(std::memory_order_relaxed);
    return (names ? *names : MakeTagNames()).m_rows;
}

// Room for `n` more bytes at the buffer's offset when the block already holds them (the case in
// which OEBuffer::Write neither grows nor fails), else null.
inline char* Room(OEBuffer* buffer, unsigned long n) {
    char* block = buffer->GetBufferPtr();
    const unsigned long end = buffer->GetBufferOffset() + n;
    if (!block || n >= 65535 || end > buffer->GetBufferAllocation() || end >= OEBuffer::kMaxBufferSize)
        return nullptr;
    return block + buffer->GetBufferOffset();
}

// Copies n bytes that do not overlap; the short texts of values (up to 32 bytes) take two or four
// overlapping word moves instead of a call.
inline void CopyBytes(char* to, const char* from, std::size_t n) {
    std::uint64_t a, b;
    if (n > 16 && n <= 32) {
        std::uint64_t c, d;
        std::memcpy(&a, from, 8);
        std::memcpy(&b, from + 8, 8);
        std::memcpy(&c, from + n - 16, 8);
        std::memcpy(&d, from + n - 8, 8);
        std::memcpy(to, &a, 8);
        std::memcpy(to + 8, &b, 8);
        std::memcpy(to + n - 16, &c, 8);
        std::memcpy(to + n - 8, &d, 8);
    } else if (n >= 8 && n <= 16) {
        std::memcpy(&a, from, 8);
        std::memcpy(&b, from + n - 8, 8);
        std::memcpy(to, &a, 8);
        std::memcpy(to + n - 8, &b, 8);
    } else if (n >= 4 && n < 8) {
        std::uint32_t c, d;
        std::memcpy(&c, from, 4);
        std::memcpy(&d, from + n - 4, 4);
        std::memcpy(to, &c, 4);
        std::memcpy(to + n - 4, &d, 4);
    } else if (n < 4) {
        for (std::size_t i = 0; i < n; ++i) to[i] = from[i];
    } else {
        std::memcpy(to, from, n);
    }
}

// Ends a write made through Room at `end`: offset and data size both move there, as after Write.
inline void Commit(OEBuffer* buffer, const char* end) {
    const unsigned long at = static_cast<unsigned long>(end - buffer->GetBufferPtr());
    buffer->SetBufferOffset(at);
    buffer->SetBufferSize(at);
}

// Writes a dictionary tag whose block has room for a fixed-size copy; false (nothing written) when
// the tag has no name or the block is short: the caller then takes PutTag's general path.
inline bool FastTag(OEBuffer* buffer, OETagID tag, OETagType type) {
    const std::vector<TagName>& names = TagRows();
    if (tag >= names.size()) return false;
    const TagName& name = names[tag];
    char* p;
    if (!name.m_text || name.m_length > kTagSlack - 4 || !(p = Room(buffer, kTagSlack))) return false;
    std::memcpy(p, type == OETT_END ? name.m_end : name.m_start, kTagSlack);
    const unsigned n = name.m_length;
    Commit(buffer, p + (type == OETT_END ? n + 4 : type == OETT_ELEMENT ? n + 2 : n + 3));
    return true;
}

} // namespace

OEBuilder::OEBuilder(OEBuildStringCrLfOpt crlf, unsigned short elemEndTags)
    : m_dictionary(OETagDictionary::TheOETagDictionary()), m_buffer(nullptr), m_stringOpt(OEBSO_STRICT),
      m_crlf(crlf), m_elemEndTags(elemEndTags), m_failedObject(nullptr) {
    g_tagNames.store(&MakeTagNames(), std::memory_order_relaxed);
}

OEBuilder::~OEBuilder() {}

void OEBuilder::Put(const char* text, unsigned long length) {
    if (length == 0) return;
    // The usual case: the bytes fit in the block as it is and are copied straight in.
    if (char* room = Room(m_buffer, length)) {
        std::memmove(room, text, length);
        Commit(m_buffer, room + length);
        return;
    }
    if (length < 65535)
        m_buffer->Write(text, static_cast<unsigned short>(length));
    else
        m_buffer->WriteLarge(text, length);
}

void OEBuilder::Put(const char* text) {
    Put(text, std::strlen(text));
}

void OEBuilder::PutLine(const char* text, unsigned long length) {
    // Text and line end in one copy when the block has room, as it usually has.
    if (char* room = Room(m_buffer, length + 1)) {
        CopyBytes(room, text, length);
        room[length] = OE_NEW_LINE[0];
        Commit(m_buffer, room + length + 1);
        return;
    }
    Put(text, length);
    Put(OE_NEW_LINE, 1);
}

const char* OEBuilder::TagText(OETagID tag) const {
    const std::vector<TagName>& names = TagRows();
    if (!m_dictionary || tag == 0 || tag >= names.size()) return nullptr;
    return names[tag].m_text;
}

OEBuildStatus OEBuilder::PutTag(OETagType type, OETagID tag) {
    const std::vector<TagName>& names = TagRows();
    if (!m_dictionary || tag == 0 || tag >= names.size() || !names[tag].m_text) return OEBS_BADARGUMENT;
    if (!m_buffer) return OEBS_BADARGUMENT;
    if (FastTag(m_buffer, tag, type)) return OEBS_OK;
    return AddTag(type, names[tag].m_text, names[tag].m_length);
}

OEBuildStatus OEBuilder::Build(OEBuffer* buffer, OEDataObj* root, OEBuildStringOpt stringOpt,
                               unsigned short checkRequired, unsigned short xmlQuote) {
    if (!buffer || !root) return OEBS_BADARGUMENT;
    OEThreadState::SetErrorCode(OETE_NONE);
    m_buffer = buffer;
    m_stringOpt = stringOpt;
    OEUtility::SetXmlQuoteMacros(xmlQuote);
    OEBuildStatus status = static_cast<OEBuildStatus>(root->Build(this));
    if (status == OEBS_OK && checkRequired) {
        OEDataObj* missingIn = root;
        OETagID missingTag = OETAG_NONE;
        if (!OEUtility::AllRequiredPresent(missingIn, &missingIn, &missingTag)) {
            SetFailedObject(missingIn);
            status = OEBS_MISSINGREQUIRED;
        }
    }
    if (OEThreadState::GetErrorCode() == OETE_OUTOFMEMORY) {
        SetFailedObject(root);
        return OEBS_OUTOFMEMORY;
    }
    return status;
}

OEBuildStatus OEBuilder::AddTag(OETagType type, const char* name) {
    if (!name) return OEBS_BADARGUMENT;
    return AddTag(type, name, std::strlen(name));
}

OEBuildStatus OEBuilder::AddTag(OETagType type, const char* name, size_t n) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    // One write per tag: "<", optional "/", the name, ">" and, except for elements, LF.
    if (char* p = Room(m_buffer, n + 4)) {
        *p++ = '<';
        if (type == OETT_END) *p++ = '/';
        CopyBytes(p, name, n);
        p += n;
        *p++ = '>';
        if (type != OETT_ELEMENT) *p++ = '\n';
        Commit(m_buffer, p);
        return OEBS_OK;
    }
    char small[128];
    if (n + 4 > sizeof(small)) {
        Put(type == OETT_END ? "</" : "<");
        Put(name, n);
        Put(type == OETT_ELEMENT ? ">" : ">\n");
        return OEBS_OK;
    }
    // One write per tag: "<", optional "/", the name, ">" and, except for elements, LF.
    char* p = small;
    *p++ = '<';
    if (type == OETT_END) *p++ = '/';
    std::memcpy(p, name, n);
    p += n;
    *p++ = '>';
    if (type != OETT_ELEMENT) *p++ = '\n';
    Put(small, static_cast<unsigned long>(p - small));
    return OEBS_OK;
}

// The usual case inline; PutTag has every other.
OEBuildStatus OEBuilder::AddTagStart(OETagID tag) {
    if (m_dictionary && m_buffer && FastTag(m_buffer, tag, OETT_START)) return OEBS_OK;
    return PutTag(OETT_START, tag);
}

OEBuildStatus OEBuilder::AddTagEnd(OETagID tag) {
    if (m_dictionary && m_buffer && FastTag(m_buffer, tag, OETT_END)) return OEBS_OK;
    return PutTag(OETT_END, tag);
}

OEBuildStatus OEBuilder::AddTagElement(OETagID tag) {
    if (m_dictionary && m_buffer && FastTag(m_buffer, tag, OETT_ELEMENT)) return OEBS_OK;
    return PutTag(OETT_ELEMENT, tag);
}

OEBuildStatus OEBuilder::AddTagElementEnd(OETagID tag) {
    return AddTagEnd(tag);
}

OEBuildStatus OEBuilder::AddBlankLine() {
    if (!m_buffer) return OEBS_BADARGUMENT;
    int v = m_crlf;
    if (v == 2 || v == 4 || v == 5 || v == 7) Put("\r", 1);
    if (v == 2 || v == 3 || v == 5 || v == 6) Put("\n", 1);
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddHeader(OEHeaderTag tag, const OEString& value) {
    if (value.GetStrLength() == 0) return OEBS_OK;
    if (!m_buffer) return OEBS_BADARGUMENT;
    OEString name;
    if (!OEDataConversion::HeaderTagToString(tag, name) || name.IsEmpty()) return OEBS_NOTEXTFORM;
    Put(name.c_str(), name.GetStrLength());
    Put(":", 1);
    Put(value.c_str(), value.GetStrLength());
    return AddBlankLine();
}

OEBuildStatus OEBuilder::AddOESShort(short value) {
    return AddOESLong(value);
}

OEBuildStatus OEBuilder::AddOEUShort(unsigned short value, char pad, unsigned short width) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    char format[16];
    std::snprintf(format, sizeof(format), "%%%c%uu", pad, static_cast<unsigned>(width));
    char text[80];
    int n = std::snprintf(text, sizeof(text), format, static_cast<unsigned>(value));
    if (n < 0) return OEBS_NOTEXTFORM;
    if (n >= static_cast<int>(sizeof(text))) n = sizeof(text) - 1;
    Put(text, static_cast<unsigned long>(n));
    Put("\n", 1);
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddOEUShort(unsigned short value) {
    return AddOEULong(value);
}

OEBuildStatus OEBuilder::AddOESLong(long value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    char text[32];
    int n = std::snprintf(text, sizeof(text), "%ld\n", value);
    Put(text, static_cast<unsigned long>(n));
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddOEULong(unsigned long value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    char text[32];
    int n = std::snprintf(text, sizeof(text), "%lu\n", value);
    Put(text, static_cast<unsigned long>(n));
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddOEChar(char value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    char text[2] = {value, '\n'};
    Put(text, 2);
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddOEBoolean(unsigned short value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    Put(value ? "Y\n" : "N\n", 2);
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddString(const OEString* value, OEBuildStringMacroOpt macros,
                                   OEBuildStringCrLfOpt crlf) {
    if (!value) return OEBS_BLANKVALUE;
    return AddString(*value, macros, crlf);
}

OEBuildStatus OEBuilder::AddString(const OEString& value, OEBuildStringMacroOpt macros,
                                   OEBuildStringCrLfOpt crlf) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    const char* text = value.c_str();
    unsigned long length = value.GetStrLength();
    bool valid = value.IsValid() != 0;
    bool tooLong = length > value.SpecLength();
    if (!valid && m_stringOpt == OEBSO_STRICT) return tooLong ? OEBS_STRINGTOOLONG : OEBS_INVALIDSTRING;
    bool truncate = !valid && tooLong; // lenient: cut the working copy to the spec length

    if (value.GetEncoding() == OESE_CDATA) {
        // The text itself, then a CDATA section holding the same text: kept as the builder's form.
        std::string work(text, length);
        work += "<![CDATA[";
        work.append(text, length);
        work += "]]>";
        if (truncate && work.size() > value.SpecLength()) work.resize(value.SpecLength());
        Put(work.data(), work.size());
    } else if (macros == OEBSM_MACROS) {
        bool xmlQuote = OEUtility::GetXmlQuoteMacros() != 0;
        const char* end = text + length;
        const char* p = FirstToEscape(text, end, xmlQuote);
        if (p == end) {
            const unsigned long n = truncate ? value.SpecLength() : length;
            // Text and line end in one copy, the common case.
            char* room = crlf == OEBCL_NEWLINE ? Room(m_buffer, n + 1) : nullptr;
            if (room) {
                CopyBytes(room, text, n);
                room[n] = OE_NEW_LINE[0];
                Commit(m_buffer, room + n + 1);
                return OEBS_OK;
            }
            Put(text, n);
        } else {
            // An entity is at most six characters, so a short text is escaped on the stack.
            char small[512];
            std::string large;
            char* work = small;
            if (length > (sizeof(small) - 1) / 6) {
                large.resize(length * 6);
                work = &large[0];
            }
            const size_t head = static_cast<size_t>(p - text);
            std::memcpy(work, text, head);
            char* w = work + head;
            for (; p < end; ++p) {
                if (const char* entity = NeedsEscape(*p, xmlQuote) ? EntityFor(*p) : nullptr) {
                    const size_t e = std::strlen(entity);
                    std::memcpy(w, entity, e);
                    w += e;
                } else {
                    *w++ = *p;
                }
            }
            size_t size = static_cast<size_t>(w - work);
            if (truncate && size > value.SpecLength()) size = value.SpecLength();
            if (crlf == OEBCL_NEWLINE) {
                PutLine(work, size);
                return OEBS_OK;
            }
            Put(work, size);
        }
    } else {
        Put(text, truncate ? value.SpecLength() : length);
    }
    if (crlf == OEBCL_NEWLINE) Put(OE_NEW_LINE, 1);
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddPrecisionInteger(const OEPrecisionInteger& value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    if (!value.IsValid()) return OEBS_NOTEXTFORM;
    // The library's own number classes keep the base text form: it is written from the stack,
    // without the number's text buffer. A class that may change the form (the payroll amount, a
    // host's subclass) goes through its conversion operator. Comparing the type records' addresses
    // may miss (a record duplicated across modules), never match wrongly.
    const std::type_info* type = &typeid(value);
    if (type == &typeid(OEPrecisionInteger) || type == &typeid(OEPosPrecisionInteger) ||
        type == &typeid(OEPercent)) {
        if (char* room = Room(m_buffer, OEPrecisionInteger::kTextSize + 1)) {
            const unsigned short n = value.FormatText(room);
            room[n] = OE_NEW_LINE[0];
            Commit(m_buffer, room + n + 1);
            return OEBS_OK;
        }
        char digits[OEPrecisionInteger::kTextSize];
        PutLine(digits, value.FormatText(digits));
        return OEBS_OK;
    }
    const char* text = static_cast<const char*>(const_cast<OEPrecisionInteger&>(value));
    if (!text) return OEThreadState::GetErrorCode() == OETE_OUTOFMEMORY ? OEBS_OUTOFMEMORY : OEBS_NOTEXTFORM;
    PutLine(text, std::strlen(text));
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddAmount(const OEPrecisionInteger& value) {
    return AddPrecisionInteger(value);
}
OEBuildStatus OEBuilder::AddQuantity(const OEPrecisionInteger& value) {
    return AddPrecisionInteger(value);
}
OEBuildStatus OEBuilder::AddUnitPrice(const OEPosPrecisionInteger& value) {
    return AddPrecisionInteger(value);
}
OEBuildStatus OEBuilder::AddRate(OEPercent value) {
    return AddPrecisionInteger(value);
}

OEBuildStatus OEBuilder::AddDateTime(const OEDateTime& value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    // A plain OEDateTime has the base text form: formatted straight into the block (see the type
    // test of AddPrecisionInteger); other classes through their own GetDateString.
    if (&typeid(value) == &typeid(OEDateTime)) {
        char* room = Room(m_buffer, OEDateTimeBase::kDateTextSize + 1);
        char text[OEDateTimeBase::kDateTextSize];
        const unsigned short n = value.FormatDate(room ? room : text);
        if (!n) return OEBS_NOTEXTFORM;
        if (!room) {
            PutLine(text, n);
            return OEBS_OK;
        }
        room[n] = OE_NEW_LINE[0];
        Commit(m_buffer, room + n + 1);
        return OEBS_OK;
    }
    // One text per thread, kept between calls: a date costs no allocation once it has grown.
    static thread_local OEString text;
    if (!const_cast<OEDateTime&>(value).GetDateString(text)) return OEBS_NOTEXTFORM;
    PutLine(text.c_str(), text.GetStrLength());
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddTime(const OETime& value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    OEString text;
    if (!const_cast<OETime&>(value).GetTimeString(text)) return OEBS_NOTEXTFORM;
    Put(text.c_str(), text.GetStrLength());
    Put("\n", 1);
    return OEBS_OK;
}

OEBuildStatus OEBuilder::PutKeywordLine(unsigned short converted, const OEString& text) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    if (!converted) return OEBS_NOTEXTFORM;
    PutLine(text.c_str(), text.GetStrLength());
    return OEBS_OK;
}

OEBuildStatus OEBuilder::PutKeyword(const OEKeywordTable& table, unsigned value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    if (value >= table.m_count || !table.m_words[value]) return OEBS_NOTEXTFORM;
    PutLine(table.m_words[value], std::strlen(table.m_words[value]));
    return OEBS_OK;
}

OEBuildStatus OEBuilder::AddKeywordString(unsigned short converted, const OEString& text) {
    return converted ? AddString(text, OEBSM_NONE, OEBCL_NEWLINE) : OEBS_NOTEXTFORM;
}

// One enumeration value writer: Writer(Param value) converts with OEDataConversion::Stem##ToString
// and hands the result to Emit (PutKeywordLine or AddKeywordString).
#define OE_KEYWORD_WRITER(Writer, Param, Stem, Emit)                                                         \
    OEBuildStatus OEBuilder::Writer(Param value) {                                                           \
        OEString text;                                                                                       \
        return Emit(OEDataConversion::Stem##ToString(value, text), text);                                    \
    }
// The same for a keyword appended directly: the text is one per thread, kept between calls (the
// append calls nothing virtual, so no other writer can run while it is in use), so a keyword
// costs no allocation.
#define OE_KEYWORD_LINE_WRITER(Writer, Param, Stem)                                                          \
    OEBuildStatus OEBuilder::Writer(Param value) {                                                           \
        static thread_local OEString text;                                                                   \
        return PutKeywordLine(OEDataConversion::Stem##ToString(value, text), text);                          \
    }

// The enumerations whose conversion is a plain look-up in one of the keyword tables (first value
// 0): the keyword is taken from the table itself, the conversion's own result.
#define OE_KEYWORD_TABLE_WRITER(Writer, Param, Table)                                                        \
    OEBuildStatus OEBuilder::Writer(Param value) {                                                           \
        return PutKeyword(Table, static_cast<unsigned>(value));                                              \
    }

OE_KEYWORD_TABLE_WRITER(AddBankTxType, OEBankTxType, OEKW_BANKTXTYPE)
OE_KEYWORD_TABLE_WRITER(AddBankAction, OEBankAction, OEKW_CORRECTACTION)
OE_KEYWORD_LINE_WRITER(AddProcCode, OEProcCode, ProcCode)
OE_KEYWORD_LINE_WRITER(AddDayOfWeek, OEDayOfWeek, DayOfWeek)
OE_KEYWORD_TABLE_WRITER(AddClientRouting, OEClientRouting, OEKW_CLIENTROUTING)
OE_KEYWORD_TABLE_WRITER(AddOFXSecurity, OEOFXSecurity, OEKW_OFXSECURITY)
OE_KEYWORD_TABLE_WRITER(AddSyncMode, OESyncMode, OEKW_SYNCMODE)
OE_KEYWORD_WRITER(AddCharacterType, OECharacterType, CharacterType, AddKeywordString)
OE_KEYWORD_TABLE_WRITER(AddBankAccountType, OEBankAccountType, OEKW_BANKACCOUNTTYPE)
OE_KEYWORD_LINE_WRITER(AddService, OEService, Service)
OE_KEYWORD_LINE_WRITER(AddService2, OEService2, Service2)
OE_KEYWORD_LINE_WRITER(AddServiceStatus, OEServiceStatus, ServiceStatus)
OE_KEYWORD_LINE_WRITER(AddServiceStatus2, OEServiceStatus2, ServiceStatus2)

OE_KEYWORD_WRITER(AddBuyType, const OEBuyType&, BuyType, AddKeywordString)
OE_KEYWORD_WRITER(AddCallType, const OECallType&, CallType, AddKeywordString)
OE_KEYWORD_WRITER(AddDuration, const OEDuration&, Duration, AddKeywordString)
OE_KEYWORD_WRITER(AddDebtClass, const OEDebtClass&, DebtClass, AddKeywordString)
OE_KEYWORD_WRITER(AddDebtType, const OEDebtType&, DebtType, AddKeywordString)
OE_KEYWORD_WRITER(AddIncomeType, const OEIncomeType&, IncomeType, AddKeywordString)
OE_KEYWORD_WRITER(AddInvAcctType, const OEInvAcctType&, InvAcctType, AddKeywordString)
OE_KEYWORD_WRITER(AddMFType, const OEMFType&, MFType, AddKeywordString)
OE_KEYWORD_WRITER(AddOptAction, const OEOptAction&, OptAction, AddKeywordString)
OE_KEYWORD_WRITER(AddOptBuyType, const OEOptBuyType&, OptBuyType, AddKeywordString)
OE_KEYWORD_WRITER(AddFidelityOptBuyType, const OEFidelityOptBuyType&, FidelityOptBuyType, AddKeywordString)
OE_KEYWORD_WRITER(AddSellReason, const OESellReason&, SellReason, AddKeywordString)
OE_KEYWORD_WRITER(AddOptSellType, const OEOptSellType&, OptSellType, AddKeywordString)
OE_KEYWORD_WRITER(AddFidelityOptSellType, const OEFidelityOptSellType&, FidelityOptSellType, AddKeywordString)
OE_KEYWORD_WRITER(AddOptType, const OEOptType&, OptType, AddKeywordString)
OE_KEYWORD_WRITER(AddPosType, const OEPosType&, PosType, AddKeywordString)
OE_KEYWORD_WRITER(AddRelType, const OERelType&, RelType, AddKeywordString)
OE_KEYWORD_WRITER(AddRestriction, const OERestriction&, Restriction, AddKeywordString)
OE_KEYWORD_WRITER(AddSecured, const OESecured&, Secured, AddKeywordString)
OE_KEYWORD_WRITER(AddSellType, const OESellType&, SellType, AddKeywordString)
OE_KEYWORD_WRITER(AddStockType, const OEStockType&, StockType, AddKeywordString)
OE_KEYWORD_WRITER(AddSubAcct, const OESubAcct&, SubAcct, AddKeywordString)
OE_KEYWORD_WRITER(AddTferAction, const OETferAction&, TferAction, AddKeywordString)
OE_KEYWORD_WRITER(AddUnitType, const OEUnitType&, UnitType, AddKeywordString)
OE_KEYWORD_WRITER(AddUSProductType, const OEUSProductType&, USProductType, AddKeywordString)
OE_KEYWORD_WRITER(AddBalType, const OEBalType&, BalType, AddKeywordString)
OE_KEYWORD_WRITER(AddAssetClass, const OEAssetClass&, AssetClass, AddKeywordString)
OE_KEYWORD_WRITER(AddCouponFreq, const OECouponFreq&, CouponFreq, AddKeywordString)
OE_KEYWORD_WRITER(AddPayeeIDScope, const OEPayeeIDScope&, PayeeIDScope, AddKeywordString)

#undef OE_KEYWORD_WRITER
#undef OE_KEYWORD_LINE_WRITER
#undef OE_KEYWORD_TABLE_WRITER

OEBuildStatus OEBuilder::AddServerID(const OEString36& value) {
    return AddString(value, OEBSM_MACROS, OEBCL_NEWLINE);
}
OEBuildStatus OEBuilder::AddPayeeID(const OEString12& value) {
    return AddString(value, OEBSM_MACROS, OEBCL_NEWLINE);
}

OEBuildStatus OEBuilder::AddLanguage(const OELanguage& value) {
    OEString text;
    if (!OEDataConversion::LanguageToString(value, text)) return OEBS_NOTEXTFORM;
    OEString3 code(text);
    return AddString(code, OEBSM_MACROS, OEBCL_NEWLINE);
}

OEBuildStatus OEBuilder::AddTagOEServerID(OETagID tag, const OEString36& value) {
    if (value.IsWhiteSpace()) return OEBS_BLANKVALUE;
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddServerID(value));
}

OEBuildStatus OEBuilder::AddTagOELanguage(OETagID tag, const OELanguage& value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddLanguage(value));
}

OEBuildStatus OEBuilder::AddTagOEPayeeID(OETagID tag, const OEString12& value) {
    if (value.IsWhiteSpace()) return OEBS_BLANKVALUE;
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddPayeeID(value));
}

OEBuildStatus OEBuilder::AddTagOEBoolean(OETagID tag, unsigned short value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddOEBoolean(value));
}

OEBuildStatus OEBuilder::AddTagOEUShort(OETagID tag, unsigned short value, char pad, unsigned short width) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddOEUShort(value, pad, width));
}

OEBuildStatus OEBuilder::AddTagOEUShort(OETagID tag, unsigned short value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddOEUShort(value));
}

OEBuildStatus OEBuilder::AddTagOESShort(OETagID tag, short value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddOESShort(value));
}

OEBuildStatus OEBuilder::AddTagOEULong(OETagID tag, unsigned long value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddOEULong(value));
}

OEBuildStatus OEBuilder::AddTagOESLong(OETagID tag, long value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddOESLong(value));
}

OEBuildStatus OEBuilder::AddTagOEString(OETagID tag, const OEString& value) {
    // A text that starts with a character other than white space is not blank: no scan needed.
    const char first = value.GetStrLength() ? value.c_str()[0] : ' ';
    const bool maybeBlank = first == ' ' || first == '\n' || first == '\r' || first == '\t';
    if (maybeBlank && value.IsWhiteSpace()) return OEBS_BLANKVALUE;
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddString(value, OEBSM_MACROS, OEBCL_NEWLINE));
}

OEBuildStatus OEBuilder::AddTagOEString(OETagID tag, const OEString* value) {
    if (!value) return OEBS_BLANKVALUE;
    return AddTagOEString(tag, *value);
}

OEBuildStatus OEBuilder::AddTagOEAmount(OETagID tag, const OEPrecisionInteger& value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddAmount(value));
}

OEBuildStatus OEBuilder::AddTagOEDateTime(OETagID tag, const OEDateTime& value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddDateTime(value));
}

OEBuildStatus OEBuilder::AddTagOETime(OETagID tag, const OETime& value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddTime(value));
}

OEBuildStatus OEBuilder::AddTagOEQuantity(OETagID tag, const OEPrecisionInteger& value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddQuantity(value));
}

OEBuildStatus OEBuilder::AddTagOEUnitPrice(OETagID tag, const OEPosPrecisionInteger& value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddUnitPrice(value));
}

OEBuildStatus OEBuilder::AddTagOERate(OETagID tag, const OEPercent& value) {
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddPrecisionInteger(value));
}

// One element writer over a value writer: element tag, Writer(value), end tag when asked for.
#define OE_ELEMENT_WRITER(Element, Param, Writer)                                                            \
    OEBuildStatus OEBuilder::Element(OETagID tag, Param value) {                                             \
        OEBuildStatus s = AddTagElement(tag);                                                                \
        return s != OEBS_OK ? s : FinishElement(tag, Writer(value));                                         \
    }

OE_ELEMENT_WRITER(AddTagOEDayOfWeek, OEDayOfWeek, AddDayOfWeek)
OE_ELEMENT_WRITER(AddTagOEProcCode, OEProcCode, AddProcCode)
OE_ELEMENT_WRITER(AddTagOEInvAcctType, const OEInvAcctType&, AddInvAcctType)
OE_ELEMENT_WRITER(AddTagOEDebtType, const OEDebtType&, AddDebtType)
OE_ELEMENT_WRITER(AddTagOEDebtClass, const OEDebtClass&, AddDebtClass)
OE_ELEMENT_WRITER(AddTagOECallType, const OECallType&, AddCallType)
OE_ELEMENT_WRITER(AddTagOEMFType, const OEMFType&, AddMFType)
OE_ELEMENT_WRITER(AddTagOEOptType, const OEOptType&, AddOptType)
OE_ELEMENT_WRITER(AddTagOEStockType, const OEStockType&, AddStockType)
OE_ELEMENT_WRITER(AddTagOEBuyType, const OEBuyType&, AddBuyType)
OE_ELEMENT_WRITER(AddTagOEIncomeType, const OEIncomeType&, AddIncomeType)
OE_ELEMENT_WRITER(AddTagOEOptAction, const OEOptAction&, AddOptAction)
OE_ELEMENT_WRITER(AddTagOEOptBuyType, const OEOptBuyType&, AddOptBuyType)
OE_ELEMENT_WRITER(AddTagOEOptSellType, const OEOptSellType&, AddOptSellType)
OE_ELEMENT_WRITER(AddTagOEPosType, const OEPosType&, AddPosType)
OE_ELEMENT_WRITER(AddTagOERelType, const OERelType&, AddRelType)
OE_ELEMENT_WRITER(AddTagOESecured, const OESecured&, AddSecured)
OE_ELEMENT_WRITER(AddTagOESellReason, const OESellReason&, AddSellReason)
OE_ELEMENT_WRITER(AddTagOESellType, const OESellType&, AddSellType)
OE_ELEMENT_WRITER(AddTagOESubAcct, const OESubAcct&, AddSubAcct)
OE_ELEMENT_WRITER(AddTagOETferAction, const OETferAction&, AddTferAction)
OE_ELEMENT_WRITER(AddTagOEUnitType, const OEUnitType&, AddUnitType)
OE_ELEMENT_WRITER(AddTagOEDuration, const OEDuration&, AddDuration)
OE_ELEMENT_WRITER(AddTagOERestriction, const OERestriction&, AddRestriction)
OE_ELEMENT_WRITER(AddTagOEBalType, const OEBalType&, AddBalType)
OE_ELEMENT_WRITER(AddTagOEAssetClass, const OEAssetClass&, AddAssetClass)
OE_ELEMENT_WRITER(AddTagOECouponFreq, const OECouponFreq&, AddCouponFreq)

#undef OE_ELEMENT_WRITER

OEBuildStatus OEBuilder::AddTagOEFrequency(OETagID tag, OEFrequency value) {
    OEString text;
    if (!OEDataConversion::FrequencyToString(value, text)) return OEBS_NOTEXTFORM;
    OEBuildStatus s = AddTagElement(tag);
    return s != OEBS_OK ? s : FinishElement(tag, AddString(text, OEBSM_NONE, OEBCL_NEWLINE));
}

OEBuildStatus OEBuilder::AddTagOEKeyword(OETagID tag, const char* keyword) {
    if (!keyword || !*keyword) return OEBS_NOTEXTFORM;
    OEBuildStatus s = AddTagElement(tag);
    if (s != OEBS_OK) return s;
    // Keywords are the library's own constant texts: nothing to escape, no bound to check.
    PutLine(keyword, std::strlen(keyword));
    return FinishElement(tag, OEBS_OK);
}

unsigned short OEBuilder::AddBuffer(OEBuffer* other) {
    if (!m_buffer || !other) return 1;
    return m_buffer->Write(other) != OEBR_SUCCESS ? 1 : 0;
}

OEBuildStatus OEPayrollBuilder::AddPayrollAmount(const OEPayrollAmount& value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    const char* text = static_cast<const char*>(const_cast<OEPayrollAmount&>(value));
    if (text) Put(text);
    Put("\n", 1);
    return OEBS_OK;
}

OEBuildStatus OEPayrollBuilder::AddPayrollDateTime(const OEPayrollDateTime& value) {
    if (!m_buffer) return OEBS_BADARGUMENT;
    OEString text;
    const_cast<OEPayrollDateTime&>(value).GetDateString(text);
    Put(text.c_str(), text.GetStrLength());
    Put("\n", 1);
    return OEBS_OK;
}
