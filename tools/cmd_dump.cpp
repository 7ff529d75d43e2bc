// oesdk dump FILE: the typed tree of a document, its parse status and every logged irregularity.
#include "command.h"
#include "support.h"

#include <cstdio>

namespace {

void PrintObject(OEDataObj* object, int depth) {
    std::string indent(static_cast<size_t>(depth) * 2, ' ');
    std::string name = TagName(object->GetType());
    if (object->GetType() == OETAG_OFXFILERS || object->GetType() == OETAG_OFXFILERQ) name = "(file)";
    std::printf("%s%s\n", indent.c_str(), name.c_str());
    OEAggregate* aggregate = dynamic_cast<OEAggregate*>(object);
    if (!aggregate) return;
    const OEAggregateDesc& d = aggregate->Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i) {
        OEString value;
        if (!aggregate->GetFieldText(&d.m_fields[i], value)) continue;
        // The password never leaves the tree through the tool either.
        bool secret = d.m_fields[i].m_tag == OETAG_USERPASS || d.m_fields[i].m_tag == OETAG_NEWUSERPASS;
        std::printf("%s  %s = %s\n", indent.c_str(), TagName(d.m_fields[i].m_tag).c_str(),
                    secret ? "********" : value.c_str());
    }
}

int Run(int argc, char** argv) {
    if (argc != 1) {
        std::fprintf(stderr, "usage: oesdk dump FILE\n");
        return 2;
    }
    Document doc;
    std::string error;
    if (!LoadDocument(argv[0], false, doc, error)) {
        std::fprintf(stderr, "oesdk dump: %s\n", error.c_str());
        return 3;
    }
    std::printf("file: %s (%s)\n", doc.path.c_str(), doc.request ? "request" : "response");
    std::printf("headers:\n");
    for (int t = OEHT_OFXHEADER; t <= OEHT_NEWFILEUID; ++t) {
        const OEString* v = doc.file->GetHeader(static_cast<OEHeaderTag>(t));
        OEString name;
        OEDataConversion::HeaderTagToString(static_cast<OEHeaderTag>(t), name);
        if (v) std::printf("  %s = %s\n", name.c_str(), v->c_str());
    }
    for (unsigned short i = 0; i < doc.file->GetNumMIMEHeaders(); ++i) {
        const OEMIMEHeader* h = doc.file->GetMIMEHeader(i);
        if (h) std::printf("  %s = %s (MIME)\n", h->GetName().c_str(), h->GetValue().c_str());
    }
    std::printf("body:\n");
    WalkTree(doc.file.get(), 1, PrintObject);
    std::printf("parse status: %d\n", static_cast<int>(doc.status));
    std::printf("irregularities: %zu\n", doc.problems.size());
    for (const LoggedProblem& p : doc.problems) {
        std::printf("  %s", p.warning.c_str());
        if (!p.tag.empty()) std::printf(" tag=%s", p.tag.c_str());
        if (!p.text.empty()) std::printf(" text=\"%s\"", p.text.c_str());
        std::printf(" offset=%lu\n", p.offset);
    }
    return doc.status == OEPS_OK || doc.status == OEPS_WARNINGS ? 0 : 1;
}

} // namespace

OE_TOOL_COMMAND(dump, "dump", "FILE",
                "parse a file and print its headers, typed tree, parse status and irregularities", Run);
