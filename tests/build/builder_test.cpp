// The builder: statuses, line ends, escaping, CDATA, strict and lenient strings, element end tags,
// the failed-object rule and the out-of-memory flag.
#include "build_helpers.h"

#include <gtest/gtest.h>

#include <string>
#include <thread>

namespace {

using namespace buildtest;

TEST(Builder, BadArgumentsAndStatuses) {
    OEBuilder builder;
    OEBuffer buffer;
    Probe root;
    EXPECT_EQ(builder.Build(nullptr, &root, OEBSO_STRICT, 0, 0), OEBS_BADARGUMENT);
    EXPECT_EQ(builder.Build(&buffer, nullptr, OEBSO_STRICT, 0, 0), OEBS_BADARGUMENT);
    EXPECT_EQ(buffer.GetBufferSize(), 0u);
    EXPECT_EQ(builder.AddTagStart(static_cast<OETagID>(0)), OEBS_BADARGUMENT) << "no buffer bound yet";

    Bound b;
    EXPECT_EQ(b.builder.AddTagStart(static_cast<OETagID>(60000)), OEBS_BADARGUMENT) << "unknown tag id";
}

TEST(Builder, LineEndOptionTable) {
    const char* expected[] = {"", "", "\r\n", "\n", "\r", "\r\n", "\n", "\r"};
    for (int v = 0; v <= 7; ++v) {
        Bound b(static_cast<OEBuildStringCrLfOpt>(v));
        b.builder.AddBlankLine();
        EXPECT_EQ(b.text(), expected[v]) << v;
    }
    Bound lf(OEBCL_LF);
    EXPECT_EQ(lf.builder.AddHeader(OEHT_VERSION, OEString("102")), OEBS_OK);
    EXPECT_EQ(lf.builder.AddHeader(OEHT_SECURITY, OEString("")), OEBS_OK); // empty: nothing
    EXPECT_EQ(lf.text(), "VERSION:102\n") << "no space after the colon";
    Bound none(OEBCL_NONE);
    none.builder.AddHeader(OEHT_OFXHEADER, OEString("100"));
    none.builder.AddHeader(OEHT_DATA, OEString("OFXSGML"));
    EXPECT_EQ(none.text(), "OFXHEADER:100DATA:OFXSGML");
}

TEST(Builder, EscapingCdataAndBlankValues) {
    Bound plain;
    plain.builder.AddTagOEString(OETAG_MEMO, OEString("A&B<C> \"q\" 'a'"));
    EXPECT_EQ(plain.text(), "<MEMO>A&amp;B&lt;C&gt; \"q\" 'a'\n");
    Bound quoted(OEBCL_CRLF, 0, OEBSO_STRICT, 1);
    quoted.builder.AddTagOEString(OETAG_MEMO, OEString("\"q\" 'a' b"));
    EXPECT_EQ(quoted.text(), "<MEMO>&quot;q&quot; &apos;a&apos; b\n") << "a space is never an entity";
    OEUtility::SetXmlQuoteMacros(0);

    Bound cdata;
    OEString x("x<y");
    x.SetEncoding(OESE_CDATA);
    cdata.builder.AddString(x, OEBSM_MACROS, OEBCL_NONE);
    EXPECT_EQ(cdata.text(), "x<y<![CDATA[x<y]]>") << "the text, then the same text as a CDATA section";

    Bound blank;
    EXPECT_EQ(blank.builder.AddTagOEString(OETAG_MEMO, OEString("   ")), OEBS_BLANKVALUE);
    EXPECT_EQ(blank.builder.AddString(static_cast<const OEString*>(nullptr), OEBSM_NONE, OEBCL_NONE),
              OEBS_BLANKVALUE);
    EXPECT_EQ(blank.text(), "");
}

// Markup at every position of texts shorter and longer than one sixteen-byte scan, written into a
// buffer that keeps growing (so both the in-place and the growing writes are taken).
TEST(Builder, EscapingFindsMarkupAtEveryPosition) {
    for (unsigned short quotes = 0; quotes < 2; ++quotes) {
        Bound b(OEBCL_CRLF, 0, OEBSO_STRICT, quotes);
        std::string expected;
        for (size_t length = 1; length <= 40; ++length) {
            for (size_t at = 0; at < length; ++at) {
                for (char c : std::string("<>&\"'")) {
                    std::string text(length, 'a');
                    text[at] = c;
                    const bool quote = c == '"' || c == '\'';
                    const char* entity = c == '<'   ? "&lt;"
                                         : c == '>' ? "&gt;"
                                         : c == '&' ? "&amp;"
                                         : c == '"' ? "&quot;"
                                                    : "&apos;";
                    std::string escaped = text;
                    if (!quote || quotes) escaped.replace(at, 1, entity);
                    ASSERT_EQ(b.builder.AddTagOEString(OETAG_MEMO, OEString(text.c_str())), OEBS_OK);
                    expected += "<MEMO>" + escaped + "\n";
                }
            }
        }
        EXPECT_EQ(b.text(), expected) << "quotes " << quotes;
    }
    OEUtility::SetXmlQuoteMacros(0);
}

TEST(Builder, StrictAndLenientStrings) {
    std::string forty(40, 'z');
    OEString32 tooLong;
    static_cast<OEString&>(tooLong) = forty.c_str();
    tooLong.SetSpecLength(32);
    Bound strict;
    EXPECT_EQ(strict.builder.AddTagOEString(OETAG_NAME, tooLong), OEBS_STRINGTOOLONG);
    EXPECT_EQ(strict.text(), "<NAME>") << "the element tag stays; nothing more";
    Bound lenient(OEBCL_CRLF, 0, OEBSO_LENIENT);
    EXPECT_EQ(lenient.builder.AddTagOEString(OETAG_NAME, tooLong), OEBS_OK);
    EXPECT_EQ(lenient.text(), "<NAME>" + std::string(32, 'z') + "\n");

    OELanguage bad("E1G"); // invalid, but not too long
    Bound strict2;
    EXPECT_EQ(strict2.builder.AddString(bad, OEBSM_NONE, OEBCL_NONE), OEBS_INVALIDSTRING);
    Bound lenient2(OEBCL_CRLF, 0, OEBSO_LENIENT);
    EXPECT_EQ(lenient2.builder.AddString(bad, OEBSM_NONE, OEBCL_NONE), OEBS_OK);
    EXPECT_EQ(lenient2.text(), "E1G");
}

TEST(Builder, ElementFormsAndValueWriters) {
    Bound sgml;
    sgml.builder.AddTagOEString(OETAG_NAME, OEString("n"));
    sgml.builder.AddTagOEBoolean(OETAG_INCLUDE, 2);
    sgml.builder.AddTagOEUShort(OETAG_APPVER, 7, '0', 3);
    sgml.builder.AddTagOESLong(OETAG_CODE, -5);
    EXPECT_EQ(sgml.text(), "<NAME>n\n<INCLUDE>Y\n<APPVER>007\n<CODE>-5\n");
    Bound xml(OEBCL_CRLF, 1);
    xml.builder.AddTagStart(OETAG_STMTTRN);
    xml.builder.AddTagOEString(OETAG_NAME, OEString("n"));
    OEPrecisionInteger amount;
    amount = "-12.50";
    xml.builder.AddTagOEAmount(OETAG_TRNAMT, amount);
    xml.builder.AddTagEnd(OETAG_STMTTRN);
    EXPECT_EQ(xml.text(), "<STMTTRN>\n<NAME>n\n</NAME>\n<TRNAMT>-12.5\n</TRNAMT>\n</STMTTRN>\n");
}

TEST(Builder, FailedObjectIsTheFirstFailureAndIsKept) {
    OEBuilder builder;
    OEBuffer buffer;
    Probe first, second;
    first.status = OEBS_NOTEXTFORM;
    second.status = OEBS_STRINGTOOLONG;
    EXPECT_EQ(builder.Build(&buffer, &first, OEBSO_STRICT, 0, 0), OEBS_NOTEXTFORM);
    EXPECT_EQ(builder.GetFailedObject(), &first);
    EXPECT_EQ(builder.Build(&buffer, &second, OEBSO_STRICT, 0, 0), OEBS_STRINGTOOLONG);
    EXPECT_EQ(builder.GetFailedObject(), &first) << "a reused builder keeps the earlier failure";
}

TEST(Builder, MemoryFlagAndUnattachedThreadGiveStatusOne) {
    OEBuilder builder;
    OEBuffer buffer;
    Probe root;
    root.raiseMemoryFlag = true;
    EXPECT_EQ(builder.Build(&buffer, &root, OEBSO_STRICT, 0, 0), OEBS_OUTOFMEMORY);
    EXPECT_EQ(builder.GetFailedObject(), &root);
    OEThreadState::SetErrorCode(OETE_NONE);

    int status = -1;
    std::thread never([&] {
        OEBuilder b;
        OEBuffer out;
        Probe quiet;
        status = b.Build(&out, &quiet, OEBSO_STRICT, 0, 0);
    });
    never.join();
    EXPECT_EQ(status, OEBS_OUTOFMEMORY);
}

TEST(Builder, RequiredCheckGivesNine) {
    OEDataObjFactory* f = OEDataObj::GetFactory();
    OEFI* fi = f->NewFI(1);
    OEBuilder builder;
    OEBuffer buffer;
    EXPECT_EQ(builder.Build(&buffer, fi, OEBSO_STRICT, 1, 0), OEBS_MISSINGREQUIRED);
    EXPECT_EQ(builder.GetFailedObject(), fi);
    fi->SetOrg(OEString("Bank"));
    OEBuilder again;
    EXPECT_EQ(again.Build(&buffer, fi, OEBSO_STRICT, 1, 0), OEBS_OK);
    delete fi;
}

} // namespace
