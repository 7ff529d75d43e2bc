// OEBuilder: writes a tree of data objects as OFX text into a caller's OEBuffer.
//
// The objects walk themselves (OEDataObj::Build) and call back one writer per tag or value. The
// builder decides the text of every tag, value, header line and line end, the escaping of markup
// characters, the CDATA form, what happens to over-long or invalid strings, and whether elements
// get end tags (SGML-like form without, XML-like form with). Every writer returns an
// OEBuildStatus; the first object that fails is recorded.
#ifndef OESDK_BUILD_OEBUILDER_H
#define OESDK_BUILD_OEBUILDER_H
#include "oeexport.h"
#include "foundation/oebuffer.h"
#include "foundation/oestatus.h"
#include "foundation/oestring.h"
#include "foundation/oeprecision.h"
#include "foundation/oedatetime.h"
#include "foundation/oedataconv.h"
#include "foundation/oepayrollamount.h"
#include "foundation/oelanguage.h"
#include "tags/oetagid.h"
#include "tags/oeheadertag.h"

#include <cstddef>

class OEDataObj;
class OETagDictionary;

// 0 = strict: an over-long or invalid string fails the build; any other value = lenient.
enum OEBuildStringOpt { OEBSO_STRICT = 0, OEBSO_LENIENT = 1 };
// 1 = replace markup characters by entity references; any other value = write as is.
enum OEBuildStringMacroOpt { OEBSM_NONE = 0, OEBSM_MACROS = 1 };
// Which line end closes a header line and a blank line: CR for 2, 4, 5, 7; then LF for 2, 3, 5, 6.
// 0 and 1 write none. As the last argument of AddString, 1 means "append OE_NEW_LINE".
enum OEBuildStringCrLfOpt {
    OEBCL_NONE = 0,
    OEBCL_NEWLINE = 1,
    OEBCL_CRLF = 2,
    OEBCL_LF = 3,
    OEBCL_CR = 4,
    OEBCL_CRLF2 = 5,
    OEBCL_LF2 = 6,
    OEBCL_CR2 = 7
};
// Argument of the raw AddTag.
enum OETagType { OETT_START = 0, OETT_END = 1, OETT_ELEMENT = 2 };

class OE_API OEBuilder {
public:
    static const char OE_NEW_LINE[];

    OEBuilder(OEBuildStringCrLfOpt crlf = OEBCL_CRLF, unsigned short elemEndTags = 0);
    OEBuilder(const OEBuilder& other) = default;
    OEBuilder& operator=(const OEBuilder& other) = default;
    virtual ~OEBuilder();

    // One build: writes `root` into `buffer`. Status 3 for a null buffer or root; 9 when the
    // walk succeeded but something required is missing (with checkRequired); 1 when the calling
    // thread's out-of-memory flag is set at the end (or the thread never attached).
    virtual OEBuildStatus Build(OEBuffer* buffer, OEDataObj* root, OEBuildStringOpt stringOpt,
                                unsigned short checkRequired, unsigned short xmlQuote);

    virtual OEBuildStatus AddTagStart(OETagID tag);
    virtual OEBuildStatus AddTagEnd(OETagID tag);
    virtual OEBuildStatus AddTagElement(OETagID tag);
    virtual OEBuildStatus AddTagElementEnd(OETagID tag);
    virtual OEBuildStatus AddHeader(OEHeaderTag tag, const OEString& value);
    virtual OEBuildStatus AddBlankLine();

    virtual OEBuildStatus AddOESShort(short value);
    virtual OEBuildStatus AddOEUShort(unsigned short value, char pad, unsigned short width);
    virtual OEBuildStatus AddOEUShort(unsigned short value);
    virtual OEBuildStatus AddOESLong(long value);
    virtual OEBuildStatus AddOEULong(unsigned long value);
    virtual OEBuildStatus AddOEChar(char value);
    virtual OEBuildStatus AddOEBoolean(unsigned short value);
    virtual OEBuildStatus AddString(const OEString& value, OEBuildStringMacroOpt macros,
                                    OEBuildStringCrLfOpt crlf);
    virtual OEBuildStatus AddString(const OEString* value, OEBuildStringMacroOpt macros,
                                    OEBuildStringCrLfOpt crlf);
    virtual OEBuildStatus AddAmount(const OEPrecisionInteger& value);
    virtual OEBuildStatus AddDateTime(const OEDateTime& value);
    virtual OEBuildStatus AddTime(const OETime& value);
    virtual OEBuildStatus AddQuantity(const OEPrecisionInteger& value);
    virtual OEBuildStatus AddUnitPrice(const OEPrecisionInteger& value);
    virtual OEBuildStatus AddRate(const OEPrecisionInteger& value);
    virtual OEBuildStatus AddBankTxType(OEBankTxType value);
    virtual OEBuildStatus AddBankAccountType(OEBankAccountType value);
    virtual OEBuildStatus AddOFXSecurity(OEOFXSecurity value);
    virtual OEBuildStatus AddSyncMode(OESyncMode value);
    virtual OEBuildStatus AddServerID(const OEString36& value);
    virtual OEBuildStatus AddLanguage(const OELanguage& value);
    virtual OEBuildStatus AddTagOEServerID(OETagID tag, const OEString36& value);
    virtual OEBuildStatus AddTagOELanguage(OETagID tag, const OELanguage& value);
    virtual OEBuildStatus AddPayeeID(const OEString12& value);

    // Element writers: tag, value, and the end tag in the XML-like form.
    virtual OEBuildStatus AddTagOEBoolean(OETagID tag, unsigned short value);
    virtual OEBuildStatus AddTagOEUShort(OETagID tag, unsigned short value, char pad, unsigned short width);
    virtual OEBuildStatus AddTagOEUShort(OETagID tag, unsigned short value);
    virtual OEBuildStatus AddTagOESShort(OETagID tag, short value);
    virtual OEBuildStatus AddTagOEULong(OETagID tag, unsigned long value);
    virtual OEBuildStatus AddTagOESLong(OETagID tag, long value);
    virtual OEBuildStatus AddTagOEString(OETagID tag, const OEString& value);
    virtual OEBuildStatus AddTagOEString(OETagID tag, const OEString* value);
    virtual OEBuildStatus AddTagOEAmount(OETagID tag, const OEPrecisionInteger& value);
    virtual OEBuildStatus AddTagOEDateTime(OETagID tag, const OEDateTime& value);
    virtual OEBuildStatus AddTagOETime(OETagID tag, const OETime& value);
    virtual OEBuildStatus AddTagOEQuantity(OETagID tag, const OEPrecisionInteger& value);
    virtual OEBuildStatus AddTagOEUnitPrice(OETagID tag, const OEPrecisionInteger& value);
    virtual OEBuildStatus AddTagOERate(OETagID tag, const OEPrecisionInteger& value);
    virtual OEBuildStatus AddTagOEPayeeID(OETagID tag, const OEString12& value);
    // An enumeration element from its keyword text (length-checked, not escaped): the common
    // form behind the per-enumeration element writers.
    virtual OEBuildStatus AddTagOEKeyword(OETagID tag, const char* keyword);

    OEBuffer* GetBuffer() const { return m_buffer; }
    // Appends another buffer's whole content; 1 when the append reports failure, else 0.
    virtual unsigned short AddBuffer(OEBuffer* other);
    virtual unsigned short GetElemEndTags() const { return m_elemEndTags; }
    virtual void SetCRLFoption(OEBuildStringCrLfOpt crlf) { m_crlf = crlf; }
    OEBuildStringCrLfOpt GetCRLFoption() const { return m_crlf; }
    OEBuildStringOpt GetStringOption() const { return m_stringOpt; }

    // The first object at which a build failed (cleared only at construction).
    OEDataObj* GetFailedObject() const { return m_failedObject; }
    // Records `object` as the failed one unless one is recorded already.
    void SetFailedObject(OEDataObj* object) {
        if (!m_failedObject) m_failedObject = object;
    }

protected:
    // The raw tag writer for a name that is not in the dictionary.
    OEBuildStatus AddTag(OETagType type, const char* name);
    OEBuildStatus AddTag(OETagType type, const char* name, size_t length);
    // The tag writer for a dictionary tag (status 3 when the id has no name).
    OEBuildStatus PutTag(OETagType type, OETagID tag);
    virtual OEBuildStatus AddPrecisionInteger(const OEPrecisionInteger& value);
    // Appends raw bytes; the buffer's own out-of-memory report ends the build with status 1.
    void Put(const char* text, unsigned long length);
    void Put(const char* text);
    OEBuildStatus FinishElement(OETagID tag, OEBuildStatus valueStatus);
    const char* TagText(OETagID tag) const;

    OETagDictionary* m_dictionary;
    OEBuffer* m_buffer;
    OEBuildStringOpt m_stringOpt;
    OEBuildStringCrLfOpt m_crlf;
    unsigned short m_elemEndTags;
    OEDataObj* m_failedObject;
};

// The payroll builder: CR LF header lines, no element end tags, and the payroll value writers.
class OE_API OEPayrollBuilder : public OEBuilder {
public:
    OEPayrollBuilder() : OEBuilder(OEBCL_CRLF, 0) {}
    virtual OEBuildStatus AddPayrollAmount(const OEPayrollAmount& value);
    virtual OEBuildStatus AddPayrollDateTime(const OEPayrollDateTime& value);
};

#endif
