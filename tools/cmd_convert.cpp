// oesdk convert FILE [--sgml|--xml] [-o OUT]: parse and write the document back.
#include "command.h"
#include "support.h"

#include <cstdio>
#include <cstring>

namespace {

int Run(int argc, char** argv) {
    const char* path = nullptr;
    const char* outPath = nullptr;
    bool xml = false, bad = false;
    for (int i = 0; i < argc; ++i) {
        if (std::strcmp(argv[i], "--xml") == 0)
            xml = true;
        else if (std::strcmp(argv[i], "--sgml") == 0)
            xml = false;
        else if (std::strcmp(argv[i], "-o") == 0 && i + 1 < argc)
            outPath = argv[++i];
        else if (!path && argv[i][0] != '-')
            path = argv[i];
        else
            bad = true;
    }
    if (!path || bad) {
        std::fprintf(stderr, "usage: oesdk convert FILE [--sgml|--xml] [-o OUT]\n");
        return 2;
    }
    Document doc;
    std::string error;
    if (!LoadDocument(path, false, doc, error)) {
        std::fprintf(stderr, "oesdk convert: %s\n", error.c_str());
        return 3;
    }
    if (doc.status != OEPS_OK && doc.status != OEPS_WARNINGS) {
        std::fprintf(stderr, "oesdk convert: %s did not parse (status %d); run 'oesdk check' for details\n",
                     path, static_cast<int>(doc.status));
        return 1;
    }
    std::string text;
    int status = WriteDocument(doc, xml, text);
    if (status != OEBS_OK) {
        std::fprintf(stderr, "oesdk convert: writing failed with build status %d\n", status);
        return 1;
    }
    if (!WriteOutput(outPath, text)) {
        std::fprintf(stderr, "oesdk convert: cannot write %s\n", outPath ? outPath : "the output");
        return 3;
    }
    return 0;
}

} // namespace

OE_TOOL_COMMAND(convert, "convert", "FILE [--sgml|--xml] [-o OUT]",
                "parse a file and write it back in the SGML-like or the XML-like form", Run);
