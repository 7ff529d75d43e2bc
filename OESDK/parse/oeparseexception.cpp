#include "parse/oeparseexception.h"

namespace {
const char* const kWarningNames[] = {
    "OEPW_UNKNOWNEXCEPTION", "OEPW_UNKNOWNTAG", "OEPW_INVALIDAGG", "OEPW_INVALIDELEM", "OEPW_BADFORMAT",
    "OEPW_OUTOFRANGE",       "OEPW_TOOLONG",    "OEPW_SKIPFAILED", "OEPW_NULLPOINTER", "OEPW_INVALIDENDAGG",
    "OEPW_MISSINGTAG",       "OEPW_LOWERCASE",  "OEPW_EXTRAAGG",   "OEPW_EMPTYELEM"};
} // namespace

OEParseException::OEParseException()
    : m_code(OEPW_UNKNOWNEXCEPTION), m_object(nullptr), m_tag(OETAG_NONE), m_offset(0) {}

OEParseException::OEParseException(const OEParseException& other)
    : m_code(other.m_code), m_object(other.m_object), m_text(other.m_text), m_auxText(other.m_auxText),
      m_tag(other.m_tag), m_offset(other.m_offset) {}

OEParseException& OEParseException::operator=(const OEParseException& other) {
    if (this != &other) DeepCopyFrom(&other);
    return *this;
}

OEParseException::~OEParseException() {}

const char* OEParseException::WarningString(OEParseWarning code) {
    unsigned int i = static_cast<unsigned int>(code);
    return i < sizeof(kWarningNames) / sizeof(kWarningNames[0]) ? kWarningNames[i] : kWarningNames[0];
}

namespace {
unsigned short AssignText(OEString& target, const char* text) {
    if (!text || !*text) {
        target = "";
        return 1;
    }
    target = text;
    return target.IsEmpty() ? 0 : 1;
}
} // namespace

unsigned short OEParseException::SetText(const char* text) {
    return AssignText(m_text, text);
}

unsigned short OEParseException::SetAuxText(const char* text) {
    return AssignText(m_auxText, text);
}

unsigned short OEParseException::DeepCopyFrom(const OEParseException* other) {
    if (!other) return 0;
    if (other == this) return 1;
    m_code = other->m_code;
    m_object = other->m_object;
    m_tag = other->m_tag;
    m_offset = other->m_offset;
    return (SetText(other->m_text) && SetAuxText(other->m_auxText)) ? 1 : 0;
}
