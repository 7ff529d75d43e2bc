#include "parse/oeparselogger.h"

#include "foundation/oebuffer.h"
#include "foundation/oethread.h"
#include "parse/oeparser.h"
#include "parse/oeutility.h"
#include "tags/oedatafactory.h"
#include "tags/oedataobj.h"

#include <cstring>

OEParseLogger::OEParseLogger()
    : m_exceptions(1, 1), m_enabled(1), m_anyLogged(0), m_detailMode(1), m_buffer(nullptr),
      m_parser(nullptr) {}

OEParseLogger::~OEParseLogger() {}

OEParseLogger* OEParseLogger::TheOEParseLogger() {
    // OEAttachThread makes one of these for every thread; a log installed otherwise is not one.
    return dynamic_cast<OEParseLogger*>(OEThreadState::GetParseLog());
}

unsigned short OEParseLogger::AppendParseException(OEParseWarning code, const OEString& text,
                                                   const OEString& auxText, OETagID tag, OEDataObj* object) {
    m_anyLogged = 1;
    if (!m_enabled) return 1;
    OEDataObjFactory* factory = OEDataObj::GetFactory();
    OEParseException* exception = factory ? factory->NewParseException() : nullptr;
    if (!exception) {
        OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
        return 0;
    }
    exception->SetCode(code);
    exception->SetTag(tag);
    exception->SetObject(object ? object : (m_parser ? m_parser->GetCurrentObject() : nullptr));
    exception->SetOffset(m_buffer ? m_buffer->GetBufferOffset() : 0);
    if (!exception->SetText(text) || !exception->SetAuxText(auxText)) {
        delete exception;
        return 0;
    }
    return AppendParseException(exception);
}

unsigned short OEParseLogger::AppendParseException(OEParseException* exception) {
    if (!exception) return 0;
    m_anyLogged = 1;
    if (!m_enabled) {
        delete exception;
        return 1;
    }
    // A password is never kept in clear, whoever reports it and in whichever text; the element's
    // own name (the text of a misplaced-element record) stays readable.
    if (exception->GetTag() == OETAG_USERPASS) {
        OEString masked(exception->GetText());
        if (masked.strcmpi("USERPASS") != 0) {
            OEUtility::MaskText(masked);
            exception->SetText(masked);
        }
        masked = exception->GetAuxText();
        OEUtility::MaskText(masked);
        exception->SetAuxText(masked);
    }
    if (!m_exceptions.Append(exception)) {
        delete exception;
        return 0;
    }
    return 1;
}

unsigned short OEParseLogger::AppendWarning(OEParseWarning code, const char* text, const char* auxText,
                                            OETagID tag, OEDataObj* object) {
    return AppendParseException(code, OEString(text), OEString(auxText), tag, object);
}

unsigned short OEParseLogger::CopyExceptionListTo(OEParseLogger* other) const {
    if (!other) return 0;
    if (other == this) return 1;
    OEDataObjFactory* factory = OEDataObj::GetFactory();
    for (unsigned short i = 0; i < m_exceptions.Entries(); ++i) {
        OEParseException* copy = factory ? factory->NewParseException() : nullptr;
        if (!copy) {
            OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
            return 0;
        }
        if (!copy->DeepCopyFrom(m_exceptions.Get(i)) || !other->m_exceptions.Append(copy)) {
            delete copy;
            return 0;
        }
    }
    if (m_exceptions.Entries()) other->m_anyLogged = 1;
    return 1;
}

unsigned short OEParseLogger::DeepCopyFrom(const OEParseLogger* other) {
    if (!other) return 0;
    if (other == this) return 1;
    DeleteAll();
    m_enabled = other->m_enabled;
    m_detailMode = other->m_detailMode;
    unsigned short ok = other->CopyExceptionListTo(this);
    m_anyLogged = other->m_anyLogged;
    return ok;
}

void OEParseLogger::DeleteAll() {
    m_exceptions.DeleteAll();
    m_anyLogged = 0;
}
