// Helpers of the message-layer tests: parse text into a file object, build a tree to text, check
// that a tree survives both written forms and a deep copy.
#ifndef OESDK_TESTS_MESSAGES_MSG_HELPERS_H
#define OESDK_TESTS_MESSAGES_MSG_HELPERS_H

#include "oesdk.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>

namespace msgtest {

// Writes strings whole (no truncation) and CDATA values as one section, so that a tree's text is a
// faithful picture of the tree.
class FaithfulBuilder : public OEBuilder {
public:
    FaithfulBuilder(unsigned short endTags) : OEBuilder(OEBCL_LF, endTags) {}
    OEBuildStatus AddString(const OEString& value, OEBuildStringMacroOpt macros,
                            OEBuildStringCrLfOpt crlf) override {
        if (!value.ExceedsSpecLength() && value.GetEncoding() != OESE_CDATA)
            return OEBuilder::AddString(value, macros, crlf);
        OEString whole(value);
        if (value.GetEncoding() == OESE_CDATA) {
            whole = (std::string("<![CDATA[") + value.c_str() + "]]>").c_str();
            whole.SetEncoding(OESE_PLAIN);
            macros = OEBSM_NONE;
        }
        whole.SetSpecLength(OEString::kUnlimited);
        return OEBuilder::AddString(whole, macros, crlf);
    }
    using OEBuilder::AddString;
};

inline OEParseStatus ParseInto(const std::string& text, OEDataObj* root, unsigned short checkRequired = 0) {
    OEBuffer buffer(static_cast<unsigned long>(text.size() + 1), 4096);
    buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    OESimpleParser parser;
    return parser.Parse(&buffer, root, checkRequired, 0);
}

// The tree as text: the body of every file or aggregate, SGML-like unless endTags is 1.
inline std::string BuildText(OEDataObj* root, unsigned short endTags = 0, int* status = nullptr) {
    OEBuffer buffer(0, 65536);
    FaithfulBuilder builder(endTags);
    int s = builder.Build(&buffer, root, OEBSO_LENIENT, 0, 0);
    if (status) *status = s;
    return std::string(buffer.GetBufferPtr() ? buffer.GetBufferPtr() : "", buffer.GetBufferSize());
}

inline bool ReadFile(const std::string& path, std::string& text) {
    FILE* f = std::fopen(path.c_str(), "rb");
    if (!f) return false;
    char chunk[8192];
    size_t n;
    while ((n = std::fread(chunk, 1, sizeof(chunk), f)) > 0) text.append(chunk, n);
    std::fclose(f);
    return true;
}

inline OEDataObjFactory* F() {
    return OEDataObj::GetFactory();
}

// Written in either form and read back into a fresh() tree, and deep-copied into another: the same
// text as the tree's every time. Reading back may log warnings only when the original did.
template <class Tree, class Make>
void ExpectRoundTrips(Tree* tree, Make fresh, bool warningsAllowed = false) {
    const std::string canonical = BuildText(tree);
    for (unsigned short endTags : {0, 1}) {
        auto again = fresh();
        const OEParseStatus status = ParseInto(BuildText(tree, endTags), again.get());
        EXPECT_TRUE(status == OEPS_OK || (warningsAllowed && status == OEPS_WARNINGS))
            << "form " << endTags << ", status " << status;
        EXPECT_EQ(BuildText(again.get()), canonical) << "form " << endTags;
    }
    auto copy = fresh();
    ASSERT_EQ(copy->DeepCopyFrom(tree), 1);
    EXPECT_EQ(BuildText(copy.get()), canonical) << "deep copy";
}

inline OEParseException* LogEntry(unsigned short i) {
    return OEParseLogger::TheOEParseLogger()->GetParseException(i);
}
inline unsigned short LogCount() {
    return OEParseLogger::TheOEParseLogger()->GetNumberParseExceptions();
}

} // namespace msgtest

#endif
