// OEParseException: one irregularity met while parsing (or while setting a value): its warning
// code, the object concerned, the offending text (a tag name or a value), an auxiliary text, the
// tag concerned and the input offset at which the tokenizer stood.
#ifndef OESDK_PARSE_OEPARSEEXCEPTION_H
#define OESDK_PARSE_OEPARSEEXCEPTION_H

#include "oeexport.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oestring.h"
#include "tags/oetagid.h"

class OEDataObj;

class OE_API OEParseException {
public:
    OEParseException();
    OEParseException(const OEParseException& other);
    OEParseException& operator=(const OEParseException& other);
    virtual ~OEParseException();

    // "OEPW_UNKNOWNEXCEPTION" ... "OEPW_EMPTYELEM"; a code outside 0..13 gives the first.
    static const char* WarningString(OEParseWarning code);
    const char* GetWarningString() const { return WarningString(m_code); }

    OEParseWarning GetCode() const { return m_code; }
    void SetCode(OEParseWarning code) { m_code = code; }
    // The object concerned (not owned; it may be gone once its tree was deleted).
    OEDataObj* GetObject() const { return m_object; }
    void SetObject(OEDataObj* object) { m_object = object; }
    const OEString& GetText() const { return m_text; }
    unsigned short SetText(const char* text);
    const OEString& GetAuxText() const { return m_auxText; }
    unsigned short SetAuxText(const char* text);
    OETagID GetTag() const { return m_tag; }
    void SetTag(OETagID tag) { m_tag = tag; }
    unsigned long GetOffset() const { return m_offset; }
    void SetOffset(unsigned long offset) { m_offset = offset; }

    // Copies every member. Returns 1, or 0 when memory is short.
    unsigned short DeepCopyFrom(const OEParseException* other);

private:
    OEParseWarning m_code;
    OEDataObj* m_object;
    OEString m_text;
    OEString m_auxText;
    OETagID m_tag;
    unsigned long m_offset;
};

#endif
