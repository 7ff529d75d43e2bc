// Warning codes of logged parse irregularities, and the channel through which value
// conversions report them to the calling thread's parse log.
#ifndef OESDK_FOUNDATION_OEPARSEWARNING_H
#define OESDK_FOUNDATION_OEPARSEWARNING_H

#include "oeexport.h"

// Tag numbers: the enumerators are generated in tags/oetagid.h.
enum OETagID : unsigned int;

// Fixed underlying type: a code from outside the list is still a valid value, which the
// lookups refuse by range check.
enum OEParseWarning : int {
    OEPW_UNKNOWNEXCEPTION = 0,
    OEPW_UNKNOWNTAG = 1,
    OEPW_INVALIDAGG = 2,
    OEPW_INVALIDELEM = 3,
    OEPW_BADFORMAT = 4,
    OEPW_OUTOFRANGE = 5,
    OEPW_TOOLONG = 6,
    OEPW_SKIPFAILED = 7,
    OEPW_NULLPOINTER = 8,
    OEPW_INVALIDENDAGG = 9,
    OEPW_MISSINGTAG = 10,
    OEPW_LOWERCASE = 11,
    OEPW_EXTRAAGG = 12,
    OEPW_EMPTYELEM = 13
};

class OEDataObj;

// What a per-thread parse log offers to the layers below the parser. The parse layer's
// OEParseLogger implements it; each attached thread owns one (see oethread.h).
class OE_API OEParseWarningLog {
public:
    virtual ~OEParseWarningLog();
    // Appends one irregularity: code, offending text, auxiliary text, tag (0 if none) and the
    // object concerned (null: the parser's current object). Returns 1 on success.
    virtual unsigned short AppendWarning(OEParseWarning code, const char* text, const char* auxText,
                                         OETagID tag, OEDataObj* object) = 0;
};

// Logs one irregularity in the calling thread's parse log. Returns 0 when the thread has no log
// (it never attached) or the log could not take the record.
OE_API unsigned short OELogParseWarning(OEParseWarning code, const char* text, const char* auxText = nullptr,
                                        OETagID tag = static_cast<OETagID>(0), OEDataObj* object = nullptr);

#endif
