// What the tool's commands share: reading a document into a typed tree, the parse log, walking the
// tree, and writing a tree back.
#ifndef OESDK_TOOLS_SUPPORT_H
#define OESDK_TOOLS_SUPPORT_H

#include "oesdk.h"

#include <memory>
#include <string>
#include <vector>

// One logged irregularity, copied out of the thread's parse log.
struct LoggedProblem {
    OEParseWarning code;
    std::string warning; // "OEPW_..."
    std::string tag;     // tag name, or empty
    std::string text;
    std::string aux;
    unsigned long offset;
};

struct Document {
    std::string path;
    std::string text;
    std::unique_ptr<OEFileOFX> file; // an OEFileRq or an OEFileRs
    bool request = false;
    OEParseStatus status = OEPS_OK;
    unsigned short headersAcceptable = 1;
    std::vector<LoggedProblem> problems;
};

// Reads and parses a file. False (with a message) when the file cannot be read or memory is
// short; a document that parses badly is still returned, with its status and problems.
bool LoadDocument(const char* path, bool checkRequired, Document& doc, std::string& error);

std::string TagName(OETagID tag);

// Calls `visit(object, depth)` for the object and every descendant, depth first.
template <class F> void WalkTree(OEDataObj* object, int depth, F&& visit) {
    if (!object) return;
    visit(object, depth);
    for (unsigned short i = 0; i < object->GetNumberOfChildren(); ++i)
        WalkTree(object->GetChild(i), depth + 1, visit);
}

// Writes the document: SGML-like form with the plain header block, or XML-like form (element end
// tags) behind an XML declaration and the OFX processing instruction. Strings longer than their
// bound are written whole. Returns the build status.
int WriteDocument(Document& doc, bool xml, std::string& out);

// Writes the text to a file, or to standard output (switched to binary on Windows, so that the
// document's own line ends pass unchanged). False when the file cannot be written.
bool WriteOutput(const char* path, const std::string& text);

// The date-time as OFX text, or empty.
std::string DateText(const OEDateTime* value);

#endif
