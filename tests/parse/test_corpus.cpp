// Every file of the shared corpus of real OFX files (read in place) goes through the tokenizer and
// the parser driver without a crash or a hang; the sanitizer build runs this too.
#include "test_aggregates.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>

namespace fs = std::filesystem;

TEST(Corpus, EveryFileTokenizesAndParses) {
    const fs::path root(OESDK_CORPUS_DIR);
    std::error_code ec;
    if (!fs::is_directory(root, ec)) GTEST_SKIP() << "corpus folder not found: " << root.string();
    int files = 0;
    for (const auto& item : fs::recursive_directory_iterator(root, ec)) {
        if (!item.is_regular_file()) continue;
        std::ifstream in(item.path(), std::ios::binary);
        std::string text((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
        OEBuffer buffer;
        buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
        ++files;

        // Tokenizer alone: every token moves forward, so more tokens than bytes means a loop.
        OEParseEngine engine(&buffer);
        OEHeaderTag tag;
        OEString name, value;
        unsigned long headers = 0, tokens = 0;
        while (engine.GetNextHeader(tag, name, value) && headers <= text.size()) ++headers;
        const OETagDictionaryEntry* entry = nullptr;
        int kind;
        while ((kind = engine.GetNextToken(entry)) != OETK_ENDOFINPUT && tokens <= text.size() + 1) {
            if (kind == OETK_AGGSTART && !entry) ADD_FAILURE() << "start tag without a row";
            ++tokens;
        }
        EXPECT_LE(headers, text.size()) << item.path();
        EXPECT_LE(tokens, text.size() + 1) << item.path();

        // The whole driver, over the test aggregates.
        auto r = testagg::Parse(text, 1, 0);
        EXPECT_TRUE(r.status == OEPS_OK || r.status == OEPS_INVALID || r.status == OEPS_BADENDTAG ||
                    r.status == OEPS_TOODEEP || r.status == OEPS_WARNINGS)
            << item.path() << " status " << r.status;
    }
    EXPECT_GT(files, 0);
}
