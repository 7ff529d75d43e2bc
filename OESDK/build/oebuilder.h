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

// The virtual operations below are the builder's table of writers and are declared in a fixed
// order: hosts derive from OEBuilder to change one piece of the output, and their overrides must
// find every writer at the same place in the table from release to release. New writers go after
// the last one (AddPrecisionInteger), never in between; helpers that need no override are
// non-virtual.
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

    // Value writers: the value's text, then OE_NEW_LINE. Without a bound buffer they answer 3.
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
    // Numbers: 2 when the value is not valid for its type (a negative unit price, a rate
    // outside 0-100) or has no text.
    virtual OEBuildStatus AddAmount(const OEPrecisionInteger& value);
    virtual OEBuildStatus AddDateTime(const OEDateTime& value);
    virtual OEBuildStatus AddTime(const OETime& value);
    virtual OEBuildStatus AddQuantity(const OEPrecisionInteger& value);
    virtual OEBuildStatus AddUnitPrice(const OEPosPrecisionInteger& value);
    virtual OEBuildStatus AddRate(OEPercent value);

    // Enumerations passed by value: the keyword appended as it is (keywords need no escaping
    // and have no bound); 2 when the value has no keyword. AddCharacterType alone goes through
    // AddString(keyword, no macros, new line), as the by-reference ones below.
    virtual OEBuildStatus AddBankTxType(OEBankTxType value);
    virtual OEBuildStatus AddBankAction(OEBankAction value);
    virtual OEBuildStatus AddProcCode(OEProcCode value);
    virtual OEBuildStatus AddDayOfWeek(OEDayOfWeek value);
    virtual OEBuildStatus AddClientRouting(OEClientRouting value);
    virtual OEBuildStatus AddOFXSecurity(OEOFXSecurity value);
    virtual OEBuildStatus AddSyncMode(OESyncMode value);
    virtual OEBuildStatus AddCharacterType(OECharacterType value);
    virtual OEBuildStatus AddBankAccountType(OEBankAccountType value);

    virtual OEBuildStatus AddServerID(const OEString36& value);
    // The code as a 3-character string, escaped: a longer code is 5 (strict) or cut (lenient).
    virtual OEBuildStatus AddLanguage(const OELanguage& value);
    virtual OEBuildStatus AddService(OEService value);
    virtual OEBuildStatus AddService2(OEService2 value);
    virtual OEBuildStatus AddServiceStatus(OEServiceStatus value);
    virtual OEBuildStatus AddServiceStatus2(OEServiceStatus2 value);

    virtual OEBuildStatus AddTagOEDayOfWeek(OETagID tag, OEDayOfWeek value);
    virtual OEBuildStatus AddTagOEProcCode(OETagID tag, OEProcCode value);
    // Converts before anything is written: a frequency without keyword leaves no element tag.
    virtual OEBuildStatus AddTagOEFrequency(OETagID tag, OEFrequency value);
    virtual OEBuildStatus AddTagOEServerID(OETagID tag, const OEString36& value);
    virtual OEBuildStatus AddTagOELanguage(OETagID tag, const OELanguage& value);

    // Enumerations passed by reference: the keyword through AddString(keyword, no macros, new
    // line), so a subclass's string writer sees them; 2 when the value has no keyword.
    virtual OEBuildStatus AddBuyType(const OEBuyType& value);
    virtual OEBuildStatus AddCallType(const OECallType& value);
    virtual OEBuildStatus AddDuration(const OEDuration& value);
    virtual OEBuildStatus AddDebtClass(const OEDebtClass& value);
    virtual OEBuildStatus AddDebtType(const OEDebtType& value);
    virtual OEBuildStatus AddIncomeType(const OEIncomeType& value);
    virtual OEBuildStatus AddInvAcctType(const OEInvAcctType& value);
    virtual OEBuildStatus AddMFType(const OEMFType& value);
    virtual OEBuildStatus AddOptAction(const OEOptAction& value);
    virtual OEBuildStatus AddOptBuyType(const OEOptBuyType& value);
    virtual OEBuildStatus AddFidelityOptBuyType(const OEFidelityOptBuyType& value);
    virtual OEBuildStatus AddSellReason(const OESellReason& value);
    virtual OEBuildStatus AddOptSellType(const OEOptSellType& value);
    virtual OEBuildStatus AddFidelityOptSellType(const OEFidelityOptSellType& value);
    virtual OEBuildStatus AddOptType(const OEOptType& value);
    virtual OEBuildStatus AddPosType(const OEPosType& value);
    virtual OEBuildStatus AddRelType(const OERelType& value);
    virtual OEBuildStatus AddRestriction(const OERestriction& value);
    virtual OEBuildStatus AddSecured(const OESecured& value);
    virtual OEBuildStatus AddSellType(const OESellType& value);
    virtual OEBuildStatus AddStockType(const OEStockType& value);
    virtual OEBuildStatus AddSubAcct(const OESubAcct& value);
    virtual OEBuildStatus AddTferAction(const OETferAction& value);
    virtual OEBuildStatus AddUnitType(const OEUnitType& value);
    virtual OEBuildStatus AddUSProductType(const OEUSProductType& value);
    virtual OEBuildStatus AddBalType(const OEBalType& value);
    virtual OEBuildStatus AddAssetClass(const OEAssetClass& value);
    virtual OEBuildStatus AddCouponFreq(const OECouponFreq& value);

    virtual OEBuildStatus AddPayeeID(const OEString12& value);
    // Taken by reference like the payee id it qualifies, and written as the enumerations above.
    virtual OEBuildStatus AddPayeeIDScope(const OEPayeeIDScope& value);

    // Element writers: the element tag, the value through its value writer and, in the XML-like
    // form (element end tags 1) and only when the value was written, the end tag on a line of its
    // own. The first non-zero status is returned; what was written before it stays.
    virtual OEBuildStatus AddTagOEBoolean(OETagID tag, unsigned short value);
    virtual OEBuildStatus AddTagOEUShort(OETagID tag, unsigned short value, char pad, unsigned short width);
    virtual OEBuildStatus AddTagOEUShort(OETagID tag, unsigned short value);
    virtual OEBuildStatus AddTagOESShort(OETagID tag, short value);
    virtual OEBuildStatus AddTagOEULong(OETagID tag, unsigned long value);
    virtual OEBuildStatus AddTagOESLong(OETagID tag, long value);
    // A null or all-white-space string is 4 and writes nothing, not even the tag.
    virtual OEBuildStatus AddTagOEString(OETagID tag, const OEString& value);
    virtual OEBuildStatus AddTagOEString(OETagID tag, const OEString* value);
    virtual OEBuildStatus AddTagOEAmount(OETagID tag, const OEPrecisionInteger& value);
    virtual OEBuildStatus AddTagOEDateTime(OETagID tag, const OEDateTime& value);
    virtual OEBuildStatus AddTagOETime(OETagID tag, const OETime& value);
    virtual OEBuildStatus AddTagOEQuantity(OETagID tag, const OEPrecisionInteger& value);
    virtual OEBuildStatus AddTagOEUnitPrice(OETagID tag, const OEPosPrecisionInteger& value);
    // Writes the percentage with AddPrecisionInteger directly, not through AddRate.
    virtual OEBuildStatus AddTagOERate(OETagID tag, const OEPercent& value);
    virtual OEBuildStatus AddTagOEInvAcctType(OETagID tag, const OEInvAcctType& value);
    virtual OEBuildStatus AddTagOEDebtType(OETagID tag, const OEDebtType& value);
    virtual OEBuildStatus AddTagOEDebtClass(OETagID tag, const OEDebtClass& value);
    virtual OEBuildStatus AddTagOECallType(OETagID tag, const OECallType& value);
    virtual OEBuildStatus AddTagOEMFType(OETagID tag, const OEMFType& value);
    virtual OEBuildStatus AddTagOEOptType(OETagID tag, const OEOptType& value);
    virtual OEBuildStatus AddTagOEStockType(OETagID tag, const OEStockType& value);
    virtual OEBuildStatus AddTagOEBuyType(OETagID tag, const OEBuyType& value);
    virtual OEBuildStatus AddTagOEIncomeType(OETagID tag, const OEIncomeType& value);
    virtual OEBuildStatus AddTagOEOptAction(OETagID tag, const OEOptAction& value);
    virtual OEBuildStatus AddTagOEOptBuyType(OETagID tag, const OEOptBuyType& value);
    virtual OEBuildStatus AddTagOEOptSellType(OETagID tag, const OEOptSellType& value);
    virtual OEBuildStatus AddTagOEPosType(OETagID tag, const OEPosType& value);
    virtual OEBuildStatus AddTagOERelType(OETagID tag, const OERelType& value);
    virtual OEBuildStatus AddTagOESecured(OETagID tag, const OESecured& value);
    virtual OEBuildStatus AddTagOESellReason(OETagID tag, const OESellReason& value);
    virtual OEBuildStatus AddTagOESellType(OETagID tag, const OESellType& value);
    virtual OEBuildStatus AddTagOESubAcct(OETagID tag, const OESubAcct& value);
    virtual OEBuildStatus AddTagOETferAction(OETagID tag, const OETferAction& value);
    virtual OEBuildStatus AddTagOEUnitType(OETagID tag, const OEUnitType& value);
    virtual OEBuildStatus AddTagOEDuration(OETagID tag, const OEDuration& value);
    virtual OEBuildStatus AddTagOERestriction(OETagID tag, const OERestriction& value);
    virtual OEBuildStatus AddTagOEBalType(OETagID tag, const OEBalType& value);
    virtual OEBuildStatus AddTagOEAssetClass(OETagID tag, const OEAssetClass& value);
    virtual OEBuildStatus AddTagOECouponFreq(OETagID tag, const OECouponFreq& value);
    virtual OEBuildStatus AddTagOEPayeeID(OETagID tag, const OEString12& value);

    OEBuffer* GetBuffer() const { return m_buffer; }
    // Appends another buffer's whole content; 1 when the append reports failure, else 0.
    virtual unsigned short AddBuffer(OEBuffer* other);
    virtual unsigned short GetElemEndTags() const { return m_elemEndTags; }

    // Non-virtual on purpose: a slot of their own would shift every writer after it.
    void SetCRLFoption(OEBuildStringCrLfOpt crlf) { m_crlf = crlf; }
    OEBuildStringCrLfOpt GetCRLFoption() const { return m_crlf; }
    OEBuildStringOpt GetStringOption() const { return m_stringOpt; }

    // An enumeration element from a keyword of a descriptor table (the aggregates' OEFK_ENUM
    // rows): element tag, the keyword as it is, end tag in the XML-like form; 2 for a null or
    // empty keyword. Non-virtual, so that it takes no place among the writers above; it goes
    // through the virtual tag writers, so a subclass that changes tags changes these too.
    OEBuildStatus AddTagOEKeyword(OETagID tag, const char* keyword);

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
    // Appends `length` bytes and OE_NEW_LINE, in one copy when the block has room.
    void PutLine(const char* text, unsigned long length);
    // The end tag of an element whose value was written, in the XML-like form.
    OEBuildStatus FinishElement(OETagID tag, OEBuildStatus valueStatus) {
        return valueStatus == OEBS_OK && m_elemEndTags == 1 ? AddTagElementEnd(tag) : valueStatus;
    }
    // The two ways a keyword is written: `converted` is the conversion's result, `text` its output.
    OEBuildStatus PutKeywordLine(unsigned short converted, const OEString& text);
    OEBuildStatus AddKeywordString(unsigned short converted, const OEString& text);
    // A keyword of `table` appended directly: 2 when `value` has none.
    OEBuildStatus PutKeyword(const OEKeywordTable& table, unsigned value);
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
