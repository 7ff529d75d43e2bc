// oesdk check FILE: exit 0 when clean, 1 with warnings only, 2 with errors; one line per problem.
#include "command.h"
#include "support.h"

#include <cstdio>

namespace {

int Run(int argc, char** argv) {
    if (argc != 1) {
        std::fprintf(stderr, "usage: oesdk check FILE\n");
        return 2;
    }
    Document doc;
    std::string error;
    if (!LoadDocument(argv[0], true, doc, error)) {
        std::fprintf(stderr, "oesdk check: %s\n", error.c_str());
        return 2;
    }
    int errors = 0, warnings = 0;
    if (doc.status != OEPS_OK && doc.status != OEPS_WARNINGS) {
        std::printf("%s: error: parsing stopped with status %d\n", doc.path.c_str(),
                    static_cast<int>(doc.status));
        ++errors;
    }
    if (!doc.headersAcceptable) {
        std::printf("%s: error: the header block is not acceptable (DATA, ENCODING or COMPRESSION)\n",
                    doc.path.c_str());
        ++errors;
    }
    for (const LoggedProblem& p : doc.problems) {
        // The parser reports only the first missing element; the walk below reports them all.
        if (p.code == OEPW_MISSINGTAG && !p.tag.empty()) continue;
        std::printf("%s:%lu: warning: %s%s%s%s%s\n", doc.path.c_str(), p.offset, p.warning.c_str(),
                    p.tag.empty() ? "" : " ", p.tag.c_str(), p.text.empty() ? "" : " ", p.text.c_str());
        ++warnings;
    }
    WalkTree(doc.file.get(), 0, [&](OEDataObj* object, int) {
        if (object->AllRequiredPresent()) return;
        std::string where = TagName(object->GetType());
        if (object->GetType() == OETAG_OFXFILERS || object->GetType() == OETAG_OFXFILERQ) {
            std::printf("%s: error: the header block has no OFXHEADER line\n", doc.path.c_str());
            ++errors;
            return;
        }
        OETagID missing = object->GetFirstMissingRequiredTag(OETAG_NONE);
        if (missing == OETAG_NONE) {
            std::printf("%s: error: %s breaks a required-element rule\n", doc.path.c_str(), where.c_str());
            ++errors;
        }
        for (; missing != OETAG_NONE; missing = object->GetFirstMissingRequiredTag(missing)) {
            std::printf("%s: error: %s is missing required %s\n", doc.path.c_str(), where.c_str(),
                        TagName(missing).c_str());
            ++errors;
        }
    });
    if (errors) return 2;
    return warnings ? 1 : 0;
}

} // namespace

OE_TOOL_COMMAND(check, "check", "FILE",
                "parse with the required-element check: exit 0 clean, 1 warnings, 2 errors", Run);
