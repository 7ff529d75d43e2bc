#include "support.h"

#include <cstdio>
#include <cstring>
#ifdef _WIN32
#include <fcntl.h>
#include <io.h>
#endif

namespace {

bool ReadWholeFile(const char* path, std::string& text) {
    FILE* f = std::fopen(path, "rb");
    if (!f) return false;
    char chunk[65536];
    size_t n;
    while ((n = std::fread(chunk, 1, sizeof(chunk), f)) > 0) text.append(chunk, n);
    bool ok = !std::ferror(f);
    std::fclose(f);
    return ok;
}

// A request document carries request wrappers; anything else is read as a response.
bool LooksLikeRequest(const std::string& text) {
    return text.find("MSGSRQV") != std::string::npos && text.find("MSGSRSV") == std::string::npos;
}

// Writes strings whole even when they exceed their bound: a converted file keeps what it read.
class PreservingBuilder : public OEBuilder {
public:
    PreservingBuilder(OEBuildStringCrLfOpt crlf, unsigned short endTags) : OEBuilder(crlf, endTags) {}
    OEBuildStatus AddString(const OEString& value, OEBuildStringMacroOpt macros,
                            OEBuildStringCrLfOpt crlf) override {
        if (!value.ExceedsSpecLength() && value.GetEncoding() != OESE_CDATA)
            return OEBuilder::AddString(value, macros, crlf);
        // Over-long text is kept whole, and a value read from a CDATA section is written back as
        // one CDATA section (the library's own CDATA form writes the text twice), which keeps
        // its blanks at either end.
        OEString whole(value);
        whole.SetSpecLength(OEString::kUnlimited);
        if (whole.GetEncoding() == OESE_CDATA) {
            std::string section = std::string("<![CDATA[") + value.c_str() + "]]>";
            whole = section.c_str();
            whole.SetSpecLength(OEString::kUnlimited);
            whole.SetEncoding(OESE_PLAIN);
            macros = OEBSM_NONE;
        }
        return OEBuilder::AddString(whole, macros, crlf);
    }
    using OEBuilder::AddString;
};

std::string HeaderOr(const OEFileOFX& file, OEHeaderTag tag, const char* fallback) {
    const OEString* v = file.GetHeader(tag);
    return v ? v->c_str() : fallback;
}

} // namespace

std::string TagName(OETagID tag) {
    if (tag == OETAG_NONE) return "";
    const char* name = OETagDictionary::TheOETagDictionary()->GetTagString(tag);
    return name ? name : "";
}

std::string DateText(const OEDateTime* value) {
    if (!value) return "";
    OEString text;
    if (!value->GetDateString(text)) return "";
    return text.c_str();
}

bool LoadDocument(const char* path, bool checkRequired, Document& doc, std::string& error) {
    doc.path = path;
    if (!ReadWholeFile(path, doc.text)) {
        error = std::string("cannot read ") + path;
        return false;
    }
    OEBuffer buffer(static_cast<unsigned long>(doc.text.size() + 1), 4096);
    if (buffer.WriteLarge(doc.text.data(), static_cast<unsigned long>(doc.text.size())) != OEBR_SUCCESS) {
        error = "out of memory";
        return false;
    }
    OEDataObjFactory* factory = OEDataObj::GetFactory();
    if (!factory) {
        error = "out of memory";
        return false;
    }
    doc.request = LooksLikeRequest(doc.text);
    doc.file.reset(doc.request ? static_cast<OEFileOFX*>(factory->NewFileRq(0)) : factory->NewFileRs(0));
    if (!doc.file) {
        error = "out of memory";
        return false;
    }
    OESimpleParser parser;
    doc.status = parser.Parse(&buffer, doc.file.get(), checkRequired ? 1 : 0, 0);
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    // Header checks go to the same log, after the parse's own records.
    if (log) log->SetBuffer(nullptr);
    doc.headersAcceptable = doc.file->ValidateHeaders();
    if (log) {
        for (unsigned short i = 0; i < log->GetNumberParseExceptions(); ++i) {
            const OEParseException* e = log->GetParseException(i);
            if (!e) continue;
            LoggedProblem p;
            p.code = e->GetCode();
            p.warning = e->GetWarningString();
            p.tag = TagName(e->GetTag());
            p.text = e->GetText().c_str();
            p.aux = e->GetAuxText().c_str();
            p.offset = e->GetOffset();
            doc.problems.push_back(p);
        }
    }
    return true;
}

int WriteDocument(Document& doc, bool xml, std::string& out) {
    OEBuffer buffer(static_cast<unsigned long>(doc.text.size() + 4096), 65536);
    PreservingBuilder builder(OEBCL_CRLF, xml ? 1 : 0);
    OEFileOFX& file = *doc.file;
    if (xml) {
        std::string head = "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"no\"?>\r\n";
        std::string version = HeaderOr(file, OEHT_VERSION, "211");
        if (version.empty() || version[0] != '2') version = "211";
        head += "<?OFX OFXHEADER=\"200\" VERSION=\"" + version + "\" SECURITY=\"" +
                HeaderOr(file, OEHT_SECURITY, "NONE") + "\" OLDFILEUID=\"" +
                HeaderOr(file, OEHT_OLDFILEUID, "NONE") + "\" NEWFILEUID=\"" +
                HeaderOr(file, OEHT_NEWFILEUID, "NONE") + "\"?>\r\n";
        buffer.WriteLarge(head.data(), static_cast<unsigned long>(head.size()));
        file.SetOmitHeaders(1);
    } else {
        // A document read from the XML form carries the 2.x header values; the plain block
        // gets the 1.x ones.
        const OEString* v = file.GetHeader(OEHT_OFXHEADER);
        if (v && std::strcmp(v->c_str(), "100") != 0) file.SetHeader(OEHT_OFXHEADER, "100");
        v = file.GetHeader(OEHT_VERSION);
        if (v && v->c_str()[0] == '2') file.SetHeader(OEHT_VERSION, "102");
        file.SetOmitHeaders(0);
    }
    // Quotes stay as they are in both forms, so that any reader gets the same text back.
    int status = builder.Build(&buffer, &file, OEBSO_LENIENT, 0, 0);
    file.SetOmitHeaders(0);
    out.assign(buffer.GetBufferPtr() ? buffer.GetBufferPtr() : "", buffer.GetBufferSize());
    return status;
}

bool WriteOutput(const char* path, const std::string& text) {
    FILE* out = stdout;
    if (path) {
        out = std::fopen(path, "wb");
        if (!out) return false;
    } else {
#ifdef _WIN32
        _setmode(_fileno(stdout), _O_BINARY);
#endif
    }
    bool ok = std::fwrite(text.data(), 1, text.size(), out) == text.size();
    if (path) ok = std::fclose(out) == 0 && ok;
    return ok;
}
