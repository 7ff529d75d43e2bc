#include "parse/oeutility.h"

#include "foundation/oestring.h"
#include "tags/oedataobj.h"

#include <cstring>

namespace {

struct MacroRow {
    const char* m_name;
    unsigned short m_length;
    char m_char;
};

// The XML-quote table; the plain table is its first four rows. Row 0 ("nbsp") only ever decodes.
const MacroRow kMacros[] = {{"nbsp", 4, ' '}, {"gt", 2, '>'},   {"lt", 2, '<'},
                            {"amp", 3, '&'},  {"quot", 4, '"'}, {"apos", 4, '\''}};
const unsigned short kPlainRows = 4;
const unsigned short kXmlRows = 6;

// Process-wide on purpose: the tokenizer and the builder read it in their inner loops.
unsigned short g_xmlQuotes = 0;

inline unsigned short RowsInForce() {
    return g_xmlQuotes ? kXmlRows : kPlainRows;
}

inline char Lower(char c) {
    return (c >= 'A' && c <= 'Z') ? static_cast<char>(c - 'A' + 'a') : c;
}

} // namespace

void OEUtility::SetXmlQuoteMacros(unsigned short on) {
    g_xmlQuotes = on ? 1 : 0;
}

unsigned short OEUtility::GetXmlQuoteMacros() {
    return g_xmlQuotes;
}

unsigned short OEUtility::ContainsMacro(const char* text) {
    if (!text) return 0;
    return text[std::strcspn(text, g_xmlQuotes ? "><&\"'" : "><&")] != 0 ? 1 : 0;
}

const char* OEUtility::GetMacroString(char c) {
    for (unsigned short i = 1; i < RowsInForce(); ++i)
        if (kMacros[i].m_char == c) return kMacros[i].m_name;
    return nullptr;
}

char OEUtility::GetMacroChar(const char* name, unsigned short length) {
    if (!name) return 0;
    for (unsigned short i = 0; i < RowsInForce(); ++i) {
        const MacroRow& row = kMacros[i];
        if (row.m_length != length) continue;
        unsigned short k = 0;
        while (k < length && Lower(name[k]) == row.m_name[k]) ++k;
        if (k == length) return row.m_char;
    }
    return 0;
}

unsigned long OEUtility::DecodeMacros(char* text, unsigned long length) {
    if (!text) return 0;
    char* end = text + length;
    char* amp = static_cast<char*>(std::memchr(text, '&', length));
    if (!amp) return length;
    char* out = amp;
    const char* in = amp;
    while (in < end) {
        if (*in == '&') {
            const char* semi =
                static_cast<const char*>(std::memchr(in + 1, ';', static_cast<std::size_t>(end - in - 1)));
            if (semi) {
                std::size_t nameLength = static_cast<std::size_t>(semi - in - 1);
                char c = nameLength <= 4 ? GetMacroChar(in + 1, static_cast<unsigned short>(nameLength)) : 0;
                if (c) {
                    *out++ = c;
                    in = semi + 1;
                    continue;
                }
            }
            // Not an entity: the ampersand stays, and the scan goes on right after it.
            *out++ = *in++;
            continue;
        }
        // Copy the plain run up to the next ampersand in one go.
        const char* next = static_cast<const char*>(std::memchr(in, '&', static_cast<std::size_t>(end - in)));
        if (!next) next = end;
        std::memmove(out, in, static_cast<std::size_t>(next - in));
        out += next - in;
        in = next;
    }
    return static_cast<unsigned long>(out - text);
}

void OEUtility::MaskText(OEString& text) {
    unsigned short length = text.GetStrLength();
    if (!length) return;
    char* p = text.LockBuffer(text.BufferSize());
    if (!p) return;
    std::memset(p, '*', length);
    text.UnlockBuffer();
}

unsigned short OEUtility::AllRequiredPresent(OEDataObj* root, OEDataObj** missingObject,
                                             OETagID* missingTag) {
    if (!root) return 1;
    if (!root->AllRequiredPresent()) {
        if (missingObject) *missingObject = root;
        if (missingTag) *missingTag = root->GetFirstMissingRequiredTag(OETAG_NONE);
        return 0;
    }
    unsigned short n = root->GetNumberOfChildren();
    for (unsigned short i = 0; i < n; ++i) {
        OEDataObj* child = root->GetChild(i);
        if (child && child != root && !AllRequiredPresent(child, missingObject, missingTag)) return 0;
    }
    return 1;
}
