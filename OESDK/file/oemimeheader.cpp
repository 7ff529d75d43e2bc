#include "file/oemimeheader.h"

OEMIMEHeader::OEMIMEHeader() {}

OEMIMEHeader::OEMIMEHeader(const char* name, const char* value) : m_name(name), m_value(value) {}

OEMIMEHeader::OEMIMEHeader(const OEMIMEHeader& other) : m_name(other.m_name), m_value(other.m_value) {}

OEMIMEHeader& OEMIMEHeader::operator=(const OEMIMEHeader& other) {
    if (this != &other) DeepCopyFrom(&other);
    return *this;
}

OEMIMEHeader::~OEMIMEHeader() {}

// OEString's assignment frees the buffer for an empty source, so an empty result is only a
// failure when the source was not empty.
unsigned short OEMIMEHeader::SetName(const OEString& name) {
    m_name = name;
    return (m_name.GetStrLength() == name.GetStrLength()) ? 1 : 0;
}

unsigned short OEMIMEHeader::SetValue(const OEString& value) {
    m_value = value;
    return (m_value.GetStrLength() == value.GetStrLength()) ? 1 : 0;
}

unsigned short OEMIMEHeader::HasName(const char* name) const {
    return name && m_name.strcmpi(name) == 0 ? 1 : 0;
}

unsigned short OEMIMEHeader::DeepCopyFrom(const OEMIMEHeader* other) {
    if (!other) return 0;
    if (other == this) return 1;
    return (SetName(other->m_name) && SetValue(other->m_value)) ? 1 : 0;
}
