// The parser driver over the tokenizer, through small table-driven aggregates.
#include "test_aggregates.h"

#include <gtest/gtest.h>

#include <atomic>
#include <cstring>
#include <thread>

using testagg::Parse;

namespace {

// A host factory for the whole program, so no default factory is left behind for the leak checker.
OEDataObjFactory g_hostFactory(1);
struct HostFactoryEnvironment : ::testing::Environment {
    void SetUp() override { OEDataObj::SetFactory(&g_hostFactory); }
    void TearDown() override { OEDataObj::SetFactory(nullptr); }
};
::testing::Environment* const g_environment = ::testing::AddGlobalTestEnvironment(new HostFactoryEnvironment);

const char* const kSgml =
    "OFXHEADER:100\r\nDATA:OFXSGML\r\nVERSION:102\r\nCONTENT-TYPE: application/x-ofx\r\n\r\n"
    "<OFX>\n<SIGNONMSGSRSV1><SONRS><STATUS><CODE>0<SEVERITY>INFO</STATUS>\n"
    "<DTSERVER>20240105120000</SONRS></SIGNONMSGSRSV1>\n"
    "<BANKMSGSRSV1><STMTTRNRS><TRNUID>1001<STMTRS><CURDEF>USD\n"
    "<BANKTRANLIST><DTSTART>20240101<STMTTRN><TRNTYPE>DEBIT<TRNAMT>-12.50<FITID>A1"
    "<name>Cafe &amp; Bar<MEMO>say &quot;hi&quot;</STMTTRN>"
    "<STMTTRN><TRNTYPE>CREDIT<TRNAMT>100.00<FITID>A2</STMTTRN></BANKTRANLIST>"
    "<LEDGERBAL><BALAMT>87.50<DTASOF>20240105</LEDGERBAL></STMTRS></STMTTRNRS>"
    "</BANKMSGSRSV1></OFX>\n";

const char* const kXml = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                         "<?OFX OFXHEADER=\"200\" VERSION=\"211\" SECURITY=\"NONE\"?>\n"
                         "<OFX>\n  <SIGNONMSGSRSV1>\n    <SONRS>\n      <STATUS>\n        <CODE>0</CODE>\n"
                         "        <SEVERITY>INFO</SEVERITY>\n      </STATUS>\n"
                         "      <DTSERVER>20240105120000</DTSERVER>\n    </SONRS>\n  </SIGNONMSGSRSV1>\n"
                         "  <BANKMSGSRSV1><STMTTRNRS><TRNUID>1001</TRNUID><STMTRS><CURDEF>USD</CURDEF>"
                         "<BANKTRANLIST><DTSTART>20240101</DTSTART><STMTTRN><TRNTYPE>DEBIT</TRNTYPE>"
                         "<TRNAMT>-12.50</TRNAMT><FITID>A1</FITID><name>Cafe &amp; Bar</name>"
                         "<MEMO>say &quot;hi&quot;</MEMO></STMTTRN><STMTTRN><TRNTYPE>CREDIT</TRNTYPE>"
                         "<TRNAMT>100.00</TRNAMT><FITID>A2</FITID></STMTTRN></BANKTRANLIST>"
                         "<LEDGERBAL><BALAMT>87.50</BALAMT><DTASOF>20240105</DTASOF></LEDGERBAL></STMTRS>"
                         "</STMTTRNRS></BANKMSGSRSV1>\n</OFX>\n";

// Wraps a fragment of STMTTRN content in the statement path.
std::string InTransaction(const std::string& body) {
    return "<OFX><BANKMSGSRSV1><STMTTRNRS><TRNUID>1<STMTRS><CURDEF>USD<BANKTRANLIST><STMTTRN>" + body +
           "</STMTTRN></BANKTRANLIST></STMTRS></STMTTRNRS></BANKMSGSRSV1></OFX>";
}

} // namespace

TEST(Parser, SgmlAndXmlFormsGiveTheSameTreeAndLog) {
    auto sgml = Parse(kSgml);
    auto xml = Parse(kXml);
    EXPECT_EQ(sgml.status, OEPS_WARNINGS); // the lower-case NAME
    EXPECT_EQ(xml.status, OEPS_WARNINGS);
    EXPECT_EQ(sgml.root->Dump(), xml.root->Dump());
    EXPECT_EQ(sgml.log, xml.log);
    ASSERT_EQ(sgml.log.size(), 1u);
    EXPECT_EQ(sgml.log[0], "OEPW_LOWERCASE name| " + std::to_string(OETAG_NAME));
    const std::string dump = sgml.root->Dump();
    EXPECT_NE(dump.find("NAME=Cafe & Bar;"), std::string::npos) << dump;
    EXPECT_NE(dump.find("STATUS{CODE=0;SEVERITY=INFO;}"), std::string::npos) << dump;
    // Headers: OFX header lines by tag, CONTENT-TYPE by name only; the XML declaration's pairs.
    EXPECT_EQ(sgml.root->Headers(),
              (std::vector<std::string>{"2:OFXHEADER=100", "3:DATA=OFXSGML", "4:VERSION=102",
                                        "-1:CONTENT-TYPE=application/x-ofx"}));
    EXPECT_EQ(xml.root->Headers(),
              (std::vector<std::string>{"2:OFXHEADER=200", "4:VERSION=211", "5:SECURITY=NONE"}));
}

TEST(Parser, QuoteEntitiesDependOnTheMode) {
    auto plain = Parse(kSgml, 0, 0);
    auto quoted = Parse(kSgml, 0, 1);
    EXPECT_NE(plain.root->Dump().find("MEMO=say &quot;hi&quot;;"), std::string::npos);
    EXPECT_NE(quoted.root->Dump().find("MEMO=say \"hi\";"), std::string::npos);
}

TEST(Parser, ValuesCommentsAndCData) {
    struct Case {
        const char* body;
        const char* memo;
    } cases[] = {
        {"<FITID>1<MEMO><![CDATA[a <b> &amp; c]]></MEMO>", "a <b> &amp; c"},
        {"<FITID>1<MEMO>x &bogus; &amp &lt;&GT;</MEMO>", "x &bogus; &amp <>"},
        {"<FITID>1<!-- note --><MEMO>  padded \t\r\n<!-- c -->", "padded"},
        {"<FITID>1</STMTTRN><!-- between --><STMTTRN><FITID>2<MEMO>second", "second"},
        {"<FITID>1<MEMO>a&nbsp;b", "a b"},
    };
    for (const auto& c : cases) {
        auto r = Parse(InTransaction(c.body));
        EXPECT_EQ(r.status, OEPS_OK) << c.body;
        EXPECT_TRUE(r.log.empty()) << c.body << ": " << r.log[0];
        EXPECT_NE(r.root->Dump().find(std::string("MEMO=") + c.memo + ";"), std::string::npos)
            << c.body << " -> " << r.root->Dump();
    }
}

TEST(Parser, IrregularitiesAreLoggedAndParsingGoesOn) {
    struct Case {
        std::string text;
        OEParseStatus status;
        std::vector<std::string> log;
        const char* mustContain;
    } cases[] = {
        // An unknown aggregate with children is skipped whole and logged once; siblings parse.
        {InTransaction("<FITID>1<XFOO><XBAR>1<STMTTRN><FITID>9</STMTTRN></xfoo><MEMO>after"),
         OEPS_WARNINGS,
         {"OEPW_UNKNOWNTAG XFOO| 0"},
         "BANKTRANLIST{STMTTRN{MEMO=after;FITID=1;}}"},
        // An unknown element (with or without its end tag) is dropped.
        {InTransaction("<FITID>1<XFOO>v</XFOO><XBAZ>w<MEMO>m"),
         OEPS_WARNINGS,
         {"OEPW_UNKNOWNTAG XFOO| 0", "OEPW_UNKNOWNTAG XBAZ| 0"},
         "STMTTRN{MEMO=m;FITID=1;}"},
        // A misplaced element is dropped; a misplaced aggregate is skipped whole.
        {InTransaction("<FITID>1<CURDEF>EUR<STATUS><CODE>0</STATUS><MEMO>m"),
         OEPS_WARNINGS,
         {"OEPW_INVALIDELEM CURDEF|EUR " + std::to_string(OETAG_CURDEF),
          "OEPW_INVALIDAGG STATUS| " + std::to_string(OETAG_STATUS)},
         "STMTTRN{MEMO=m;FITID=1;}"},
        // An unknown aggregate without an end tag: skip fails, position restored.
        {InTransaction("<FITID>1<XFOO><MEMO>m"),
         OEPS_WARNINGS,
         {"OEPW_UNKNOWNTAG XFOO| 0", "OEPW_SKIPFAILED XFOO| 0"},
         "STMTTRN{MEMO=m;FITID=1;}"},
        // Empty elements, both spellings.
        {InTransaction("<FITID>1<MEMO></MEMO><NAME/>"),
         OEPS_WARNINGS,
         {"OEPW_EMPTYELEM MEMO| " + std::to_string(OETAG_MEMO),
          "OEPW_EMPTYELEM NAME| " + std::to_string(OETAG_NAME)},
         "STMTTRN{FITID=1;}"},
        // A value the object cannot convert: logged by the object, the parse goes on.
        {InTransaction("<FITID>1<TRNAMT>BAD"),
         OEPS_WARNINGS,
         {"OEPW_BADFORMAT TRNAMT|BAD " + std::to_string(OETAG_TRNAMT)},
         "STMTTRN{FITID=1;}"},
        // A value longer than any string is cut and logged.
        {InTransaction("<FITID>1<MEMO>" + std::string(70000, 'm')),
         OEPS_WARNINGS,
         {"OEPW_TOOLONG MEMO| " + std::to_string(OETAG_MEMO)},
         "FITID=1;"},
        // Text after the end of the body is not read.
        {InTransaction("<FITID>1") + "garbage <<< </NOPE>", OEPS_OK, {}, "FITID=1;"},
    };
    for (const auto& c : cases) {
        auto r = Parse(c.text);
        EXPECT_EQ(r.status, c.status) << c.text;
        EXPECT_EQ(r.log, c.log) << c.text;
        EXPECT_NE(r.root->Dump().find(c.mustContain), std::string::npos) << r.root->Dump();
    }
}

TEST(Parser, StoppingStatuses) {
    std::string nested = "<OFX><BANKMSGSRSV1><STMTTRNRS><TRNUID>1<STMTRS><CURDEF>USD";
    std::string deep7, deep8; // with the 3 + 1 levels above: 10 and 11 open below the root
    for (int i = 0; i < 6; ++i) deep7 += "<BANKTRANLIST>";
    deep8 = deep7 + "<BANKTRANLIST>";
    std::string close;
    for (int i = 0; i < 6; ++i) close += "</BANKTRANLIST>";
    std::string tail = "</STMTRS></STMTTRNRS></BANKMSGSRSV1></OFX>";

    struct Case {
        std::string text;
        OEParseStatus status;
        const char* firstLog;
        OETagID errorObject;
    } cases[] = {
        {nested + deep7 + "<DTSTART>1" + close + tail, OEPS_OK, nullptr, OETAG_NONE},
        {nested + deep8 + "<DTSTART>1", OEPS_TOODEEP, "OEPW_INVALIDAGG BANKTRANLIST", OETAG_BANKTRANLIST},
        {nested + "<BANKTRANLIST><DTSTART>1", OEPS_INVALID, nullptr, OETAG_BANKTRANLIST},
        {nested + "</STMTTRNRS>", OEPS_BADENDTAG, "OEPW_INVALIDENDAGG STMTTRNRS", OETAG_STMTRS},
        // An element's own end tag is passed over once; a second one closes nothing.
        {nested + "<CURDEF>EUR</CURDEF></CURDEF>", OEPS_BADENDTAG, "OEPW_INVALIDENDAGG CURDEF", OETAG_STMTRS},
        {nested + "<CURDEF>EUR</CURDEF>\n" + tail, OEPS_OK, nullptr, OETAG_NONE},
        {nested + "<TRNAMT 5", OEPS_INVALID, "OEPW_BADFORMAT <TRNAMT 5", OETAG_STMTRS},
        // A name too long for a 16-bit length is malformed, not a cut-down CURDEF.
        {nested + "<CURDEF" + std::string(65536, 'X') + ">EUR", OEPS_INVALID, "OEPW_BADFORMAT <CURDEFX",
         OETAG_STMTRS},
        {nested + "</CURDEF> stray text <CURDEF>", OEPS_INVALID, "OEPW_UNKNOWNTAG stray text", OETAG_STMTRS},
    };
    for (const auto& c : cases) {
        auto r = Parse(c.text);
        EXPECT_EQ(r.status, c.status) << c.text;
        if (c.firstLog) {
            ASSERT_FALSE(r.log.empty()) << c.text;
            EXPECT_EQ(r.log[0].compare(0, std::strlen(c.firstLog), c.firstLog), 0) << r.log[0];
        }
        if (c.errorObject != OETAG_NONE) {
            ASSERT_NE(r.objectWithError, nullptr) << c.text;
            EXPECT_EQ(r.objectWithError->GetType(), c.errorObject) << c.text;
        }
    }
}

TEST(Parser, RequiredTagsAreCheckedOverTheTree) {
    auto r = Parse(InTransaction("<MEMO>no fitid"), 1);
    EXPECT_EQ(r.status, OEPS_WARNINGS);
    ASSERT_EQ(r.log.size(), 1u);
    EXPECT_EQ(r.log[0], "OEPW_MISSINGTAG FITID| " + std::to_string(OETAG_FITID));
    EXPECT_EQ(Parse(InTransaction("<FITID>1"), 1).status, OEPS_OK);
}

TEST(Parser, DisabledLoggingStillReportsWarnings) {
    OEBuffer buffer;
    buffer.WriteString(InTransaction("<FITID>1<XFOO>1").c_str());
    testagg::Agg root(OETAG_NONE, 1);
    OESimpleParser parser;
    parser.EnableLogging(0);
    EXPECT_EQ(parser.Parse(&buffer, &root, 0, 0), OEPS_WARNINGS);
    EXPECT_EQ(parser.GetNumberParseExceptions(), 0);
    EXPECT_EQ(parser.GetAnyParseExceptionsLogged(), 1);
    parser.EnableLogging(1);
}

TEST(Parser, PasswordNeverStaysInClear) {
    for (const char* place : {"<SONRS><STATUS><CODE>0</STATUS><DTSERVER>1<USERPASS>s3cret</SONRS>",
                              "<SONRS><STATUS><CODE>0</STATUS><DTSERVER>1</SONRS><USERPASS>s3cret"}) {
        OEBuffer buffer;
        buffer.WriteString(
            (std::string("<OFX><SIGNONMSGSRSV1>") + place + "</SIGNONMSGSRSV1></OFX>").c_str());
        testagg::Agg root(OETAG_NONE, 1);
        OEParseEngine engine(&buffer);
        OESimpleParser parser;
        parser.SetParseEngine(&engine);
        parser.Parse(&buffer, &root, 0, 0);
        EXPECT_EQ(std::string(engine.GetValue().c_str()).find("s3cret"), std::string::npos);
        for (const auto& line : testagg::LogLines())
            EXPECT_EQ(line.find("s3cret"), std::string::npos) << line;
    }
    // Misplaced, the element is logged with its name and the masked value.
    EXPECT_EQ(testagg::LogLines().back(),
              "OEPW_INVALIDELEM USERPASS|****** " + std::to_string(OETAG_USERPASS));
    // A reporter that logs the password itself is masked by the log.
    OELogParseWarning(OEPW_TOOLONG, "s3cret", "s3cret", OETAG_USERPASS);
    EXPECT_EQ(testagg::LogLines().back(), "OEPW_TOOLONG ******|****** " + std::to_string(OETAG_USERPASS));
}

TEST(Parser, EachThreadHasItsOwnLog) {
    auto first = Parse(InTransaction("<FITID>1<XFOO>1"));
    ASSERT_EQ(first.log.size(), 1u);
    std::atomic<int> otherCount{-1};
    std::thread t([&] {
        OEAttachThread(OEPlatform::CurrentThreadId());
        OEParseLogger* own = OEParseLogger::TheOEParseLogger();
        EXPECT_NE(own, nullptr);
        auto r = Parse(InTransaction("<FITID>1<XA>1<XB>2"));
        otherCount = static_cast<int>(r.log.size());
        OEDetachThread(OEPlatform::CurrentThreadId());
    });
    t.join();
    EXPECT_EQ(otherCount, 2);
    EXPECT_EQ(testagg::LogLines(), first.log);
}

TEST(Parser, UnattachedThreadGetsStatus3) {
    OEParseStatus status = OEPS_OK;
    std::thread t([&] { status = Parse(InTransaction("<FITID>1")).status; });
    t.join();
    EXPECT_EQ(status, OEPS_NORESOURCE);
}

namespace {
int g_allocations = 0, g_failAt = 0;
int FailNth(std::size_t) {
    return ++g_allocations == g_failAt ? 1 : 0;
}
} // namespace

TEST(Parser, EveryAllocationFailureGivesStatus3) {
    // Irregular input, so that the log allocates too.
    const std::string text = std::string(kSgml) + "<XFOO>1";
    OEBuffer buffer;
    buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    for (g_failAt = 1;; ++g_failAt) {
        testagg::Agg root(OETAG_NONE, 1);
        OESimpleParser parser;
        g_allocations = 0;
        OEMemory::FailureHook old = OEMemory::SetFailureHook(FailNth);
        OEParseStatus status = parser.Parse(&buffer, &root, 1, 0);
        OEMemory::SetFailureHook(old);
        if (g_allocations < g_failAt) {
            EXPECT_EQ(status, OEPS_WARNINGS); // every allocation succeeded
            break;
        }
        EXPECT_EQ(status, OEPS_NORESOURCE) << "failing allocation " << g_failAt;
    }
    EXPECT_GT(g_failAt, 3);
}

namespace {
// An object with a chosen valid table and message-set version, for the parser's tag filter.
class Filtered : public OEDataObj {
public:
    Filtered(const OETagRow* rows, unsigned short count, unsigned short version)
        : OEDataObj(version), m_rows(rows), m_count(count) {}
    unsigned short GetArrayOfValidTags(OEArrayOfTags& tags) const override {
        tags.Set(m_rows, m_count);
        return 1;
    }

private:
    const OETagRow* m_rows;
    unsigned short m_count;
};
} // namespace

TEST(Parser, TagFilterAnswersAsTheWholeTableWhateverCameBefore) {
    // The filter remembers where it last found a tag; the queries below move between objects whose
    // tables hold the same tags at other rows, under other masks, or tags that share its memory
    // slot (ids 512 apart), and every answer must still be the table's own.
    const OETagID a = static_cast<OETagID>(100), b = static_cast<OETagID>(612),
                  c = static_cast<OETagID>(1124);
    const OETagRow first[] = {{a, OEVM_V1, 0}, {b, OEVM_ALL, 0}, {a, OEVM_NOTV1, 0}};
    const OETagRow second[] = {{b, OEVM_V2, 0}, {c, OEVM_ALL, 0}, {a, OEVM_ALL, 0}};
    struct Object {
        const OETagRow* rows;
        unsigned short count, version;
    } objects[] = {{first, 3, 1},  {first, 3, 2}, {second, 3, 1},
                   {second, 3, 2}, {first, 3, 0}, {first, 0, 1}};
    OEParser parser;
    Filtered root(nullptr, 0, 1);
    parser.Parse(nullptr, &root, 0, 0);
    for (OETagID tag : {a, b, c}) EXPECT_EQ(parser.IsValidTag(tag), 1) << "no table: every tag passes";
    // Every order of two objects, each asked about every tag twice.
    for (const Object& x : objects) {
        for (const Object& y : objects) {
            for (const Object* o : {&x, &y}) {
                Filtered current(o->rows, o->count, o->version);
                ASSERT_EQ(parser.PushObject(&current), 1);
                for (int round = 0; round < 2; ++round) {
                    for (OETagID tag : {a, b, c, a}) {
                        unsigned short expected = 0; // some row has the tag and covers the version
                        for (unsigned short i = 0; i < o->count; ++i)
                            if (o->rows[i].m_tag == tag && (o->rows[i].m_versionMask & o->version))
                                expected = 1;
                        EXPECT_EQ(parser.IsValidTag(tag), expected)
                            << "tag " << tag << " version " << o->version << " rows " << o->count;
                    }
                }
                ASSERT_EQ(parser.PopObject(), 1);
            }
        }
    }
}
