// OEMIMEHeader: one MIME header line of an OFX file (for example "content-type"), a name and a
// value. Files keep them in order and write them back as "name: value".
#ifndef OESDK_FILE_OEMIMEHEADER_H
#define OESDK_FILE_OEMIMEHEADER_H

#include "oeexport.h"
#include "foundation/oestring.h"

class OE_API OEMIMEHeader {
public:
    OEMIMEHeader();
    OEMIMEHeader(const char* name, const char* value);
    OEMIMEHeader(const OEMIMEHeader& other);
    OEMIMEHeader& operator=(const OEMIMEHeader& other);
    virtual ~OEMIMEHeader();

    const OEString& GetName() const { return m_name; }
    const OEString& GetValue() const { return m_value; }
    // Return 1, or 0 when memory is short.
    unsigned short SetName(const OEString& name);
    unsigned short SetValue(const OEString& value);
    // 1 when the name equals `name` ignoring case (MIME header names are case-insensitive).
    unsigned short HasName(const char* name) const;
    // Copies name and value. Returns 1, or 0 when memory is short.
    unsigned short DeepCopyFrom(const OEMIMEHeader* other);

private:
    OEString m_name;
    OEString m_value;
};

#endif
