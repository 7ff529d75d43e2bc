// OEParseLogger: the calling thread's log of parse irregularities. Each attached thread owns one
// (made by OEAttachThread, destroyed by OEDetachThread); TheOEParseLogger() finds it. A parse
// empties it first, so after a parse it holds exactly that parse's exceptions until the next one.
#ifndef OESDK_PARSE_OEPARSELOGGER_H
#define OESDK_PARSE_OEPARSELOGGER_H

#include "oeexport.h"
#include "foundation/oedynarr.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oestring.h"
#include "parse/oeparseexception.h"

class OEBuffer;
class OEParser;

class OE_API OEParseLogger : public OEParseWarningLog {
public:
    OEParseLogger();
    ~OEParseLogger() override;
    OEParseLogger(const OEParseLogger&) = delete;
    OEParseLogger& operator=(const OEParseLogger&) = delete;

    // The calling thread's logger, or null when the thread never attached.
    static OEParseLogger* TheOEParseLogger();

    // Appends one exception. The any-exception-logged flag is set first, even when logging is
    // disabled; disabled, the record is dropped and 1 returned. Otherwise a new exception is made
    // through the data-object factory (none: thread error 1, 0) and filled in: a null object
    // means the parser's current object; the offset is the input buffer's current offset.
    unsigned short AppendParseException(OEParseWarning code, const OEString& text, const OEString& auxText,
                                        OETagID tag, OEDataObj* object);
    // Takes ownership of a ready exception (deleted when it cannot be kept). Same flag rules.
    unsigned short AppendParseException(OEParseException* exception);
    // The channel used by the value types (OELogParseWarning).
    unsigned short AppendWarning(OEParseWarning code, const char* text, const char* auxText, OETagID tag,
                                 OEDataObj* object) override;

    unsigned short GetNumberParseExceptions() const { return m_exceptions.Entries(); }
    // Null when the index is out of range.
    OEParseException* GetParseException(unsigned short index) const { return m_exceptions.Get(index); }
    unsigned short GetAnyParseExceptionsLogged() const { return m_anyLogged; }
    // Appends copies of every exception to another logger. Returns 1, or 0 when memory is short.
    unsigned short CopyExceptionListTo(OEParseLogger* other) const;
    // Replaces this logger's exceptions, flags and detail mode by copies of another's.
    unsigned short DeepCopyFrom(const OEParseLogger* other);
    // Deletes every exception and clears the any-exception-logged flag.
    void DeleteAll();

    void EnableLogging(unsigned short enabled) { m_enabled = enabled ? 1 : 0; }
    unsigned short GetLoggingEnabled() const { return m_enabled; }
    // Detail mode 1 (the default) looks names up for the texts it records; 0 keeps them terse.
    void SetDetailMode(unsigned short mode) { m_detailMode = mode; }
    unsigned short GetDetailMode() const { return m_detailMode; }

    // The input of the running parse and its parser (not owned; the parser sets and clears both).
    void SetBuffer(OEBuffer* buffer) { m_buffer = buffer; }
    OEBuffer* GetBuffer() const { return m_buffer; }
    void SetParser(OEParser* parser) { m_parser = parser; }
    OEParser* GetParser() const { return m_parser; }

private:
    OEPtrArray<OEParseException> m_exceptions;
    unsigned short m_enabled;
    unsigned short m_anyLogged;
    unsigned short m_detailMode;
    OEBuffer* m_buffer;
    OEParser* m_parser;
};

#endif
