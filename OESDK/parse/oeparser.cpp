#include "parse/oeparser.h"

#include "foundation/oebuffer.h"
#include "foundation/oememory.h"
#include "foundation/oethread.h"
#include "parse/oeparseengine.h"
#include "parse/oeparselogger.h"
#include "parse/oeutility.h"

// ---------------------------------------------------------------------------------------------
// OEParser

OEParser::OEParser() : m_current(nullptr), m_stack{}, m_depth(0), m_rowHint{} {
    if (OEParseLogger* log = OEParseLogger::TheOEParseLogger()) {
        log->EnableLogging(1);
        log->DeleteAll();
    }
}

OEParser::~OEParser() {
    // The log outlives parsers: make sure it never reaches back into this one.
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    if (log && log->GetParser() == this) {
        log->SetParser(nullptr);
        log->SetBuffer(nullptr);
    }
}

OEParseStatus OEParser::Parse(OEBuffer*, OEDataObj* root, unsigned short, unsigned short xmlQuotes) {
    m_current = root;
    m_depth = 0;
    m_validTags = OEArrayOfTags();
    OEUtility::SetXmlQuoteMacros(xmlQuotes);
    if (root) root->SetupForParsing(this);
    return OEPS_OK;
}

unsigned short OEParser::PushObject(OEDataObj* obj) {
    if (!obj || m_depth >= kMaxDepth) return 0;
    m_stack[m_depth].m_object = m_current;
    m_stack[m_depth].m_validTags = m_validTags;
    ++m_depth;
    m_current = obj;
    m_validTags = OEArrayOfTags();
    obj->GetArrayOfValidTags(m_validTags);
    obj->SetupForParsing(this);
    return 1;
}

unsigned short OEParser::PopObject() {
    if (m_depth < 1) return 0;
    // A closed aggregate is no longer being parsed: it forgets the parser.
    if (m_current) m_current->SetupForParsing(nullptr);
    --m_depth;
    m_current = m_stack[m_depth].m_object;
    m_validTags = m_stack[m_depth].m_validTags;
    if (m_current) m_current->SetupForParsing(this);
    return 1;
}

// Any row of the table with the tag whose version mask covers the current object's version.
// A tag almost always meets the same table again (every transaction of a statement), so the row
// that answered last time is tried first.
inline unsigned short OEParser::CheckTag(OETagID tag) const {
    if (!m_validTags.m_rows) return 1;
    const unsigned short hint = m_rowHint[static_cast<unsigned>(tag) % kHintSlots];
    if (hint < m_validTags.m_count && m_validTags.m_rows[hint].m_tag == tag && m_current &&
        (m_validTags.m_rows[hint].m_versionMask & m_current->GetMsgSetVersion()))
        return 1;
    return SearchTag(tag);
}

unsigned short OEParser::SearchTag(OETagID tag) const {
    if (m_validTags.m_count == 0) return 0;
    unsigned short version = m_current ? m_current->GetMsgSetVersion() : 0;
    for (unsigned short i = 0; i < m_validTags.m_count; ++i) {
        const OETagRow& row = m_validTags.m_rows[i];
        if (row.m_tag == tag && (row.m_versionMask & version)) {
            m_rowHint[static_cast<unsigned>(tag) % kHintSlots] = i;
            return 1;
        }
    }
    return 0;
}

unsigned short OEParser::IsValidTag(OETagID tag) const {
    return CheckTag(tag);
}

unsigned short OEParser::AppendParseException(OEParseWarning code, const OEString& text,
                                              const OEString& auxText, OETagID tag, OEDataObj* object) {
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    if (!log) return 0;
    return log->AppendParseException(code, text, auxText, tag, object ? object : m_current);
}

unsigned short OEParser::AppendParseException(OEParseException* exception) {
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    if (!log) {
        delete exception;
        return 0;
    }
    return log->AppendParseException(exception);
}

unsigned short OEParser::GetNumberParseExceptions() const {
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    return log ? log->GetNumberParseExceptions() : 0;
}

OEParseException* OEParser::GetParseException(unsigned short index) const {
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    return log ? log->GetParseException(index) : nullptr;
}

unsigned short OEParser::GetAnyParseExceptionsLogged() const {
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    return log ? log->GetAnyParseExceptionsLogged() : 0;
}

unsigned short OEParser::CopyExceptionListTo(OEParseLogger* other) const {
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    return log ? log->CopyExceptionListTo(other) : 0;
}

void OEParser::EnableLogging(unsigned short enabled) {
    if (OEParseLogger* log = OEParseLogger::TheOEParseLogger()) log->EnableLogging(enabled);
}

// ---------------------------------------------------------------------------------------------
// OESimpleParser

OESimpleParser::OESimpleParser() : m_engine(nullptr), m_objectWithError(nullptr) {}

OESimpleParser::~OESimpleParser() {}

namespace {

const char* NameOf(const OETagDictionaryEntry* entry) {
    return entry && entry->m_name ? entry->m_name : "";
}

} // namespace

OEParseStatus OESimpleParser::Parse(OEBuffer* buffer, OEDataObj* root, unsigned short checkRequired,
                                    unsigned short xmlQuotes) {
    m_objectWithError = nullptr;
    if (!buffer || !root) return OEPS_NORESOURCE;
    OEParser::Parse(buffer, root, checkRequired, xmlQuotes);

    OEThreadState::SetErrorCode(OETE_NONE);
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    if (!log) { // the thread never attached
        root->SetupForParsing(nullptr);
        return OEPS_NORESOURCE;
    }
    log->DeleteAll();
    log->SetBuffer(buffer);
    log->SetParser(this);

    OEParseEngine* engine = m_engine;
    bool ownEngine = false;
    if (!engine) {
        engine = OEMemory::New<OEParseEngine>(buffer);
        if (!engine) {
            OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
            root->SetupForParsing(nullptr);
            log->SetBuffer(nullptr);
            log->SetParser(nullptr);
            return OEPS_NORESOURCE;
        }
        ownEngine = true;
    }

    // Header lines go to the object that is current (the root).
    OEParseStatus status = OEPS_OK;
    {
        OEHeaderTag tag;
        OEString name, value;
        while (status == OEPS_OK && engine->GetNextHeader(tag, name, value))
            status = m_current->HandleHeader(tag, value, &name);
    }

    // A file object's body may open with the "--boundary" line of a multipart transmission.
    if (status == OEPS_OK && (root->GetType() == OETAG_OFXFILERQ || root->GetType() == OETAG_OFXFILERS)) {
        if (!engine->SkipBoundaryLine()) status = OEPS_INVALID;
    }

    if (status == OEPS_OK) {
        const bool skipping = engine->GetSkipElementEndTags();
        engine->SetSkipElementEndTags(true);
        status = RunTokenLoop(*engine);
        engine->SetSkipElementEndTags(skipping);
    }

    if (status != OEPS_OK && status != OEPS_NORESOURCE) m_objectWithError = m_current;

    if (checkRequired) {
        OEDataObj* missingObject = nullptr;
        OETagID missingTag = OETAG_NONE;
        if (!OEUtility::AllRequiredPresent(root, &missingObject, &missingTag)) {
            OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
            const OETagDictionaryEntry* entry =
                (dictionary && missingTag) ? dictionary->FindDictionaryEntry(missingTag) : nullptr;
            AppendParseException(OEPW_MISSINGTAG, OEString(NameOf(entry)), OEString(), missingTag,
                                 missingObject);
        }
    }

    if (status == OEPS_OK && log->GetAnyParseExceptionsLogged()) {
        status = OEPS_WARNINGS;
        // The object of the first exception says more than the root, which is current again.
        if (!m_objectWithError) {
            OEParseException* first = log->GetParseException(0);
            m_objectWithError = (first && first->GetObject()) ? first->GetObject() : m_current;
        }
    }
    if (OEThreadState::GetErrorCode() != OETE_NONE) status = OEPS_NORESOURCE;

    if (ownEngine) delete engine;
    // Objects left open by a stopped parse are no longer being parsed either.
    for (short i = m_depth; i > 0; --i) {
        if (m_current) m_current->SetupForParsing(nullptr);
        --m_depth;
        m_current = m_stack[m_depth].m_object;
        m_validTags = m_stack[m_depth].m_validTags;
    }
    root->SetupForParsing(nullptr);
    // The log keeps its exceptions but lets go of this parse's input.
    log->SetBuffer(nullptr);
    log->SetParser(nullptr);
    return status;
}

OEParseStatus OESimpleParser::RunTokenLoop(OEParseEngine& engine) {
    int previousKind = OETK_ERROR;
    OETagID previousElement = OETAG_NONE;
    for (;;) {
        const OETagDictionaryEntry* entry = nullptr;
        int kind = engine.GetNextToken(entry);
        OETagID id = entry ? entry->m_id : OETAG_NONE;
        switch (kind) {
        case OETK_AGGSTART:
            if (CheckTag(id)) {
                OEParseStatus status = m_current->HandleTagStart(entry);
                if (status == OEPS_INVALID && engine.LastStartWasEmpty()) {
                    // "<MEMO></MEMO>": an element without a value, not an aggregate.
                    AppendParseException(OEPW_EMPTYELEM, OEString(NameOf(entry)), OEString(), id, m_current);
                    engine.SkipAggregate(NameOf(entry));
                    break;
                }
                if (status != OEPS_OK) {
                    AppendParseException(OEPW_INVALIDAGG, OEString(NameOf(entry)), OEString(), id, m_current);
                    return status;
                }
            } else {
                AppendParseException(OEPW_INVALIDAGG, OEString(NameOf(entry)), OEString(), id, m_current);
                engine.SkipAggregate(NameOf(entry));
            }
            break;
        case OETK_ELEMENT: {
            OEString& value = engine.GetValue();
            const bool password = id == OETAG_USERPASS;
            if (CheckTag(id)) {
                OEParseStatus status = m_current->HandleTagElement(entry, value);
                if (password) OEUtility::MaskText(value);
                if (status != OEPS_OK) return status;
            } else {
                if (password) OEUtility::MaskText(value);
                AppendParseException(OEPW_INVALIDELEM, OEString(NameOf(entry)), value, id, m_current);
            }
            previousElement = id;
            // Its end tag came with it: the loop stands where it would after passing over it.
            if (engine.LastElementClosed()) kind = OETK_ENDTAG;
            break;
        }
        case OETK_ENDTAG:
            // The optional end tag of the element just read (XML-like form).
            if (previousKind == OETK_ELEMENT && previousElement == id) break;
            {
                OEParseStatus status = m_current->HandleTagEnd(entry);
                if (status != OEPS_OK) return status;
            }
            if (id == OETAG_OFX) return OEPS_OK; // whatever follows the body is not read
            break;
        case OETK_ENDOFINPUT:
            return m_depth > 0 ? OEPS_INVALID : OEPS_OK;
        default:
            AppendParseException(OEPW_UNKNOWNTAG, engine.GetValue(), OEString(), id, m_current);
            return OEPS_INVALID;
        }
        previousKind = kind;
    }
}
