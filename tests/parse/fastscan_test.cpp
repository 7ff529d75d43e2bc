// The tokenizer's one-pass path for common tokens against the general scanner: over the corpus
// and over generated documents full of odd constructs, both must give the same tokens, values,
// flags, buffer offsets and log entries, with and without element end tags consumed, and with the
// driver's skip of an aggregate in between.
#include "../foundation/values_testlog.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <sstream>
#include <string>
#include <vector>

namespace {

namespace fs = std::filesystem;

// Everything the driver can see of the token stream of `text`, as one text.
std::string Tokens(const std::string& text, bool fast, bool skipElementEnds) {
    OEBuffer buffer;
    buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    ScopedWarningLog log;
    OEParseEngine engine(&buffer);
    engine.SetFastScan(fast);
    engine.SetSkipElementEndTags(skipElementEnds);
    std::ostringstream out;
    OEHeaderTag tag;
    OEString name, value;
    for (unsigned long n = 0; engine.GetNextHeader(tag, name, value) && n <= text.size(); ++n)
        out << "H " << tag << ' ' << name.c_str() << '=' << value.c_str() << '\n';
    const OETagDictionaryEntry* entry = nullptr;
    for (unsigned long n = 0; n <= text.size() + 1; ++n) {
        const int kind = engine.GetNextToken(entry);
        out << kind << ' ' << (entry ? entry->m_name : "-") << " @" << buffer.GetBufferOffset();
        if (kind == OETK_ELEMENT || kind == OETK_ERROR) {
            const OEString& v = engine.GetValue();
            out << " [" << std::string(v.c_str(), v.GetStrLength()) << "] " << v.GetEncoding() << " closed "
                << engine.LastElementClosed();
        }
        if (kind == OETK_AGGSTART) {
            out << " empty " << engine.LastStartWasEmpty();
            // The driver skips aggregates it does not take: do so for one kind.
            if (entry && entry->m_id == OETAG_BANKACCTFROM)
                out << " skip " << engine.SkipAggregate(entry->m_name);
        }
        for (const RecordedWarning& w : log.Entries()) out << " {" << w.code << ' ' << w.text << '}';
        log.Clear();
        out << '\n';
        if (kind == OETK_ENDOFINPUT) break;
    }
    return out.str();
}

// The first line where two token listings part, or "" when they are the same.
std::string FirstDifference(const std::string& a, const std::string& b) {
    std::istringstream left(a), right(b);
    std::string l, r;
    for (int line = 1;; ++line) {
        const bool moreLeft = static_cast<bool>(std::getline(left, l));
        const bool moreRight = static_cast<bool>(std::getline(right, r));
        if (!moreLeft && !moreRight) return "";
        if (!moreLeft || !moreRight || l != r)
            return "line " + std::to_string(line) + ": general '" + l + "' vs fast '" + r + "'";
    }
}

void ExpectSameTokens(const std::string& text, const std::string& what) {
    for (bool skip : {false, true})
        ASSERT_EQ("", FirstDifference(Tokens(text, false, skip), Tokens(text, true, skip)))
            << what << (skip ? ", element end tags consumed" : "");
}

TEST(FastScan, CorpusFilesGiveTheSameTokens) {
    const fs::path root(OESDK_CORPUS_DIR);
    std::error_code ec;
    if (!fs::is_directory(root, ec)) GTEST_SKIP() << "corpus folder not found: " << root.string();
    for (const auto& item : fs::recursive_directory_iterator(root, ec)) {
        if (!item.is_regular_file()) continue;
        std::ifstream in(item.path(), std::ios::binary);
        ExpectSameTokens(std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()),
                         item.path().string());
    }
}

TEST(FastScan, GeneratedDocumentsGiveTheSameTokens) {
    // Pieces of well-formed and broken markup; documents are random runs of them, long enough
    // that most tokens stand far from the end (where the one-pass path is allowed).
    const std::vector<std::string> pieces = {"<STMTTRN>",
                                             "</STMTTRN>",
                                             "<NAME>",
                                             "</NAME>",
                                             "Bob",
                                             "Jo &amp; Sons",
                                             "&lt;",
                                             "  ",
                                             "\n",
                                             "\r\n",
                                             "\t",
                                             std::string(20, ' '),
                                             "<MEMO></MEMO>",
                                             "<MEMO>\n</MEMO>",
                                             "<!-- note -->",
                                             "<!---->",
                                             "<![CDATA[a<b]]>",
                                             "<?xml version=\"1.0\"?>",
                                             "<name>",
                                             "<Name>",
                                             "</name>",
                                             "<NOSUCHTAG>",
                                             "</NOSUCHTAG>",
                                             "<NOSUCHTAG>x",
                                             "<NAME/>",
                                             "< NAME>",
                                             "</ NAME>",
                                             "<NAME >",
                                             "<>",
                                             "</>",
                                             "<",
                                             ">",
                                             "/",
                                             std::string(1, '\0'),
                                             "\x80",
                                             "<TRNAMT>",
                                             "-1.50",
                                             "<DTPOSTED>20240105",
                                             "<BANKACCTFROM>",
                                             "</BANKACCTFROM>",
                                             "<BANKID>",
                                             "123",
                                             "<ABCDEFGHIJKLMNOPQRSTUVWXYZ>",
                                             "<CORRECTFITID>",
                                             "</CORRECTFITID>",
                                             "<K.EMPLOYEE>",
                                             std::string(40, 'v'),
                                             "<!x>",
                                             "<1A>",
                                             "<.X>",
                                             "<OFX>",
                                             "</OFX>",
                                             "<STMTTRN><TRNTYPE>DEBIT</TRNTYPE></STMTTRN>"};
    std::mt19937 random(20261122);
    for (int doc = 0; doc < 3000; ++doc) {
        std::string text;
        const int count = 10 + static_cast<int>(random() % 80);
        for (int i = 0; i < count; ++i) text += pieces[random() % pieces.size()];
        ExpectSameTokens(text, "document " + std::to_string(doc));
        if (HasFatalFailure()) return;
    }
}

} // namespace
