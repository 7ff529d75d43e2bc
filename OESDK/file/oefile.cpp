#include "file/oefile.h"

#include "build/oebuilder.h"
#include "foundation/oedataconv.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oethread.h"
#include "messages/oemsgset.h"
#include "tags/oedatafactory.h"

#include <cstdio>

const char OEMIME_CONTENTLENGTH[] = "content-length";
const char OEMIME_CONTENTTYPE[] = "content-type";
const char OEMIME_OFXTYPE[] = "application/x-ofx";

namespace {

inline bool IsOFXHeader(int tag) {
    return tag >= OEHT_OFXHEADER && tag <= OEHT_NEWFILEUID;
}

const char* HeaderName(OEHeaderTag tag) {
    static const char* const names[] = {"CONTENT-TYPE", "CONTENT-LENGTH", "OFXHEADER", "DATA",
                                        "VERSION",      "SECURITY",       "ENCODING",  "CHARSET",
                                        "COMPRESSION",  "OLDFILEUID",     "NEWFILEUID"};
    return tag >= 0 && tag <= 10 ? names[tag] : "";
}

} // namespace

// ================================================================ OEFile

OEFile::OEFile(unsigned short version)
    : OEDataObj(version), m_mime(4, 4), m_omitHeaders(0), m_subfiles(1, 1), m_headerSet{} {
    SetType(OETAG_MIME);
}

OEFile::~OEFile() {}

unsigned short OEFile::SetHeader(OEHeaderTag tag, const OEString* value) {
    if (!IsOFXHeader(tag) || !value || value->IsWhiteSpace()) return 0;
    m_headers[tag] = *value;
    if (m_headers[tag].IsNull()) return 0; // no memory for the copy
    m_headerSet[tag] = true;
    return 1;
}

unsigned short OEFile::SetHeader(OEHeaderTag tag, const char* value) {
    if (!value) return 0;
    OEString text(value);
    return SetHeader(tag, &text);
}

const OEString* OEFile::GetHeader(OEHeaderTag tag) const {
    return IsOFXHeader(tag) && m_headerSet[tag] ? &m_headers[tag] : nullptr;
}

OEParseStatus OEFile::HandleHeader(OEHeaderTag tag, const OEString& value, OEString* name) {
    if (value.IsWhiteSpace()) return OEPS_OK;
    if (static_cast<int>(tag) != -1 && SetHeader(tag, &value)) return OEPS_OK;
    if (!name || name->IsEmpty()) return OEPS_NORESOURCE;
    OEMIMEHeader* header = GetMIMEHeader(name);
    bool fresh = false;
    if (!header) {
        OEDataObjFactory* factory = GetFactory();
        header = factory ? factory->NewMIMEHeader() : nullptr;
        if (!header) return OEPS_NORESOURCE;
        fresh = true;
    }
    if (!header->SetName(*name) || !header->SetValue(value)) {
        if (fresh) delete header;
        return OEPS_NORESOURCE;
    }
    if (fresh && !m_mime.Append(header)) {
        delete header;
        return OEPS_NORESOURCE;
    }
    return OEPS_OK;
}

OEMIMEHeader* OEFile::GetMIMEHeader(const OEString* name) const {
    if (!name) return nullptr;
    for (unsigned short i = 0; i < m_mime.Entries(); ++i)
        if (m_mime.Get(i) && m_mime.Get(i)->HasName(name->c_str())) return m_mime.Get(i);
    return nullptr;
}

unsigned short OEFile::AppendSubfile(const OEFile* subfile) {
    return SetSubfile(m_subfiles.Entries(), subfile);
}

unsigned short OEFile::SetSubfile(unsigned short index, const OEFile* subfile) {
    if (!subfile || index > m_subfiles.Entries()) return 0;
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return 0;
    OEFile* copy = nullptr;
    switch (subfile->GetType()) {
    case OETAG_OFXFILERQ:
        copy = factory->NewFileRq(subfile->GetMsgSetVersion());
        break;
    case OETAG_OFXFILERS:
        copy = factory->NewFileRs(subfile->GetMsgSetVersion());
        break;
    default:
        copy = factory->NewFile(subfile->GetMsgSetVersion());
        break;
    }
    if (!copy) return 0;
    if (!copy->DeepCopyFrom(subfile) || !m_subfiles.Set(index, copy)) {
        delete copy;
        return 0;
    }
    return 1;
}

OEDataObj* OEFile::GetChild(unsigned short index) const {
    return m_subfiles.Get(index);
}
unsigned short OEFile::GetNumberOfChildren() const {
    return m_subfiles.Entries();
}

int OEFile::BuildHeaders(OEBuilder* builder) {
    for (unsigned short i = 0; i < m_mime.Entries(); ++i) {
        OEMIMEHeader* h = m_mime.Get(i);
        if (!h) return OEBS_BADARGUMENT;
        OEString line(h->GetName());
        line += ": ";
        line += h->GetValue().c_str();
        line += '\r';
        int status = builder->AddString(line, OEBSM_NONE, OEBCL_NEWLINE);
        if (status != OEBS_OK) return status;
    }
    return OEBS_OK;
}

int OEFile::Build(OEBuilder* builder) {
    if (!m_omitHeaders) {
        int status = BuildHeaders(builder);
        if (status != OEBS_OK) return status;
    }
    OEString boundaryLine;
    if (!m_boundary.IsEmpty()) {
        boundaryLine = "--";
        boundaryLine += m_boundary.c_str();
    }
    int pending = OEBS_OK;
    for (unsigned short i = 0; i < m_subfiles.Entries(); ++i) {
        if (pending != OEBS_OK) return pending;
        OEFile* sub = m_subfiles.Get(i);
        if (!sub) return OEBS_BADARGUMENT;
        if (!boundaryLine.IsEmpty()) builder->AddString(boundaryLine, OEBSM_NONE, OEBCL_NEWLINE);
        OEBuffer text(0, 4096);
        OEBuilder inner(OEBCL_CRLF, 0);
        int status = inner.Build(&text, sub, OEBSO_STRICT, 1, 0);
        if (status != OEBS_OK) return status;
        char size[32];
        std::snprintf(size, sizeof(size), "%ld", static_cast<long>(text.GetBufferSize()));
        OEString lengthName(OEMIME_CONTENTLENGTH), lengthValue(size);
        if (sub->HandleHeader(static_cast<OEHeaderTag>(-1), lengthValue, &lengthName) != OEPS_OK)
            return OEBS_OUTOFMEMORY;
        if (sub->GetType() == OETAG_OFXFILERQ || sub->GetType() == OETAG_OFXFILERS) {
            OEString typeName(OEMIME_CONTENTTYPE), typeValue(OEMIME_OFXTYPE);
            if (sub->HandleHeader(static_cast<OEHeaderTag>(-1), typeValue, &typeName) != OEPS_OK)
                return OEBS_OUTOFMEMORY;
        }
        sub->BuildHeaders(builder);
        pending = builder->AddBuffer(&text) ? OEBS_OUTOFMEMORY : OEBS_OK;
    }
    if (!m_mimeBody.IsEmpty()) builder->AddString(m_mimeBody, OEBSM_NONE, OEBCL_NEWLINE);
    if (!boundaryLine.IsEmpty()) {
        boundaryLine += "--";
        return builder->AddString(boundaryLine, OEBSM_MACROS, OEBCL_NEWLINE);
    }
    return pending;
}

unsigned short OEFile::DeepCopyFrom(const OEFile* other) {
    if (!other) return 0;
    if (other == this) return 1;
    m_mime.DeleteAll();
    for (unsigned short i = 0; i < other->m_mime.Entries(); ++i) {
        OEMIMEHeader* h = new (std::nothrow) OEMIMEHeader();
        if (!h || !h->DeepCopyFrom(other->m_mime.Get(i)) || !m_mime.Append(h)) {
            delete h;
            return 0;
        }
    }
    m_omitHeaders = other->m_omitHeaders;
    m_boundary = other->m_boundary;
    m_mimeBody = other->m_mimeBody;
    m_subfiles.DeleteAll();
    for (unsigned short i = 0; i < other->m_subfiles.Entries(); ++i)
        if (!AppendSubfile(other->m_subfiles.Get(i))) return 0;
    for (int t = 0; t < 11; ++t) {
        m_headerSet[t] = other->m_headerSet[t];
        m_headers[t] = other->m_headers[t];
    }
    return CopyBaseMembersFrom(other);
}

// ================================================================ OEFileOFX

OEFileOFX::OEFileOFX(unsigned short version) : OEFile(version), m_mfa(0) {}

const char* OEFileOFX::DefaultHeader(OEHeaderTag tag, unsigned short version) const {
    switch (tag) {
    case OEHT_OFXHEADER:
        return "100";
    case OEHT_DATA:
        return "OFXSGML";
    case OEHT_VERSION:
        return version == 2 ? "151" : (m_mfa ? "103" : "102");
    case OEHT_ENCODING:
        return "USASCII";
    case OEHT_CHARSET:
        return "1252";
    case OEHT_SECURITY:
    case OEHT_COMPRESSION:
    case OEHT_OLDFILEUID:
    case OEHT_NEWFILEUID:
        return "NONE";
    default:
        return "";
    }
}

unsigned short OEFileOFX::AddDefaultOFXHeaders(unsigned short version) {
    if (version == 0) version = OEDataObj::GetMsgSetVersion();
    if (version == 0) version = 1;
    for (int t = OEHT_OFXHEADER; t <= OEHT_NEWFILEUID; ++t) {
        OEHeaderTag tag = static_cast<OEHeaderTag>(t);
        if (GetHeader(tag)) continue;
        if (!SetHeader(tag, DefaultHeader(tag, version))) break;
    }
    return 1;
}

int OEFileOFX::BuildHeaders(OEBuilder* builder) {
    int status = OEFile::BuildHeaders(builder);
    if (status != OEBS_OK) return status;
    if (m_mime.Entries() > 0) builder->AddBlankLine();
    unsigned short version = OEDataObj::GetMsgSetVersion();
    for (int t = OEHT_OFXHEADER; t <= OEHT_NEWFILEUID; ++t) {
        OEHeaderTag tag = static_cast<OEHeaderTag>(t);
        const OEString* stored = GetHeader(tag);
        OEString fallback(DefaultHeader(tag, version));
        status = builder->AddHeader(tag, stored ? *stored : fallback);
        if (status != OEBS_OK) return status;
    }
    return builder->AddBlankLine();
}

unsigned short OEFileOFX::ValidateHeaders() {
    unsigned short result = 1;
    char type[16];
    std::snprintf(type, sizeof(type), "%u", static_cast<unsigned>(GetType()));
    for (int t = OEHT_OFXHEADER; t <= OEHT_NEWFILEUID; ++t) {
        OEHeaderTag tag = static_cast<OEHeaderTag>(t);
        const OEString* stored = GetHeader(tag);
        if (!stored) {
            OELogParseWarning(OEPW_MISSINGTAG, HeaderName(tag), type, OETAG_NONE, this);
            continue;
        }
        OEString value(*stored);
        value.MakeUpper();
        bool bad = false, fatal = false;
        switch (tag) {
        case OEHT_OFXHEADER:
            bad = value != "100";
            break;
        // The keyword tables of the header enumerations, compared here so that each fault is
        // reported once (the conversions report a refused word themselves).
        case OEHT_DATA:
            fatal = bad = value != "OFXSGML";
            break;
        case OEHT_VERSION:
            bad = value != "102" && value != "103" && value != "151";
            break;
        case OEHT_ENCODING:
            fatal = bad = value != "USASCII" && value != "UTF-8";
            break;
        case OEHT_CHARSET:
            bad = value != "1252";
            break;
        case OEHT_COMPRESSION:
            fatal = bad = value != "NONE";
            break;
        default:
            break;
        }
        if (bad) OELogParseWarning(OEPW_BADFORMAT, stored->c_str(), type, OETAG_NONE, this);
        if (fatal) result = 0;
    }
    return result;
}

unsigned short OEFileOFX::AllRequiredPresent() {
    if (!GetHeader(OEHT_OFXHEADER)) return 0;
    return OEFile::AllRequiredPresent();
}

unsigned short OEFileOFX::DeepCopyFrom(const OEFile* other) {
    if (!OEFile::DeepCopyFrom(other)) return 0;
    if (const OEFileOFX* ofx = dynamic_cast<const OEFileOFX*>(other)) m_mfa = ofx->m_mfa;
    return 1;
}

// ================================================================ OEFileRq / OEFileRs

OEFileBodies::OEFileBodies(unsigned short version, bool request)
    : OEFileOFX(version), m_request(request), m_bodies(1, 1) {}
OEFileBodies::~OEFileBodies() {}

OEDataObj* OEFileBodies::NewBody(OEDataObjFactory* factory, unsigned short version) const {
    return m_request ? static_cast<OEDataObj*>(factory->NewRequest(version))
                     : static_cast<OEDataObj*>(factory->NewResponse(version));
}

unsigned short OEFileBodies::StoreBody(unsigned short index, OEDataObj* body) {
    if (!body || index > m_bodies.Entries()) return 0;
    return m_bodies.Set(index, body);
}

OEParseStatus OEFileBodies::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry || entry->m_id != OETAG_OFX) return OEDataObj::HandleTagStart(entry);
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    OEDataObj* body = NewBody(factory, OEDataObj::GetMsgSetVersion());
    if (!body) {
        OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
        return OEPS_NORESOURCE;
    }
    if (!m_bodies.Append(body)) {
        delete body;
        return OEPS_NORESOURCE;
    }
    body->SetType(OETAG_OFX);
    // The file keeps no presence marks for its bodies (its valid table is open, so that an
    // element directly under it reaches the handler below).
    return PushAndSetObject(body, OETAG_NONE);
}

OEParseStatus OEFileBodies::HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) {
    OELogParseWarning(OEPW_INVALIDELEM, entry ? entry->m_name : "", value.c_str(),
                      entry ? entry->m_id : OETAG_NONE, this);
    return OEPS_INVALID;
}

int OEFileBodies::BuildBodies(OEBuilder* builder) {
    for (unsigned short i = 0; i < m_bodies.Entries(); ++i) {
        OEDataObj* body = m_bodies.Get(i);
        if (!body) continue;
        int status = body->BuildObject(builder, OETAG_NONE);
        if (status != OEBS_OK) return status;
    }
    return OEBS_OK;
}

OEDataObj* OEFileBodies::GetChild(unsigned short index) const {
    if (index < m_bodies.Entries()) return m_bodies.Get(index);
    return OEFile::GetChild(static_cast<unsigned short>(index - m_bodies.Entries()));
}

unsigned short OEFileBodies::GetNumberOfChildren() const {
    return static_cast<unsigned short>(m_bodies.Entries() + OEFile::GetNumberOfChildren());
}

unsigned short OEFileBodies::DeepCopyFrom(const OEFile* other) {
    if (!OEFileOFX::DeepCopyFrom(other)) return 0;
    // Bodies are copied only from a file of the same side.
    const OEFileBodies* src = dynamic_cast<const OEFileBodies*>(other);
    if (!src || src == this || src->m_request != m_request) return 1;
    m_bodies.DeleteAll();
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return 0;
    for (unsigned short i = 0; i < src->m_bodies.Entries(); ++i) {
        OEDataObj* copy = NewBody(factory, 0);
        if (!copy) return 0;
        if (!m_bodies.Append(copy)) {
            delete copy;
            return 0;
        }
        const OEDataObj* from = src->m_bodies.Get(i);
        unsigned short ok =
            m_request ? static_cast<OERequest*>(copy)->DeepCopyFrom(static_cast<const OERequest*>(from))
                      : static_cast<OEResponse*>(copy)->DeepCopyFrom(static_cast<const OEResponse*>(from));
        if (!ok) return 0;
    }
    return 1;
}

OEFileRq::OEFileRq(unsigned short version) : OEFileBodies(version, true) {
    SetType(OETAG_OFXFILERQ);
}

unsigned short OEFileRq::AppendRequest(OERequest* request) {
    return StoreBody(m_bodies.Entries(), request);
}

unsigned short OEFileRq::SetRequest(unsigned short index, OERequest* request) {
    return StoreBody(index, request);
}

OERequest* OEFileRq::GetRequest(unsigned short index) const {
    return static_cast<OERequest*>(m_bodies.Get(index));
}

int OEFileRq::Build(OEBuilder* builder) {
    int headerStatus = OEFile::Build(builder);
    int status = BuildBodies(builder);
    return status != OEBS_OK ? status : headerStatus;
}

OEFileRs::OEFileRs(unsigned short version) : OEFileBodies(version, false) {
    SetType(OETAG_OFXFILERS);
}

unsigned short OEFileRs::AppendResponse(OEResponse* response) {
    return StoreBody(m_bodies.Entries(), response);
}

unsigned short OEFileRs::SetResponse(unsigned short index, OEResponse* response) {
    return StoreBody(index, response);
}

OEResponse* OEFileRs::GetResponse(unsigned short index) const {
    return static_cast<OEResponse*>(m_bodies.Get(index));
}

int OEFileRs::Build(OEBuilder* builder) {
    int status = OEFile::Build(builder);
    return status != OEBS_OK ? status : BuildBodies(builder);
}
