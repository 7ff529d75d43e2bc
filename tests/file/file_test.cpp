// The OFX file envelope: default headers, the version header's choice, validation and its
// leniency, MIME headers, elements under the file, the request/response asymmetry.
#include "oesdk.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

namespace {

OEDataObjFactory* F() {
    return OEDataObj::GetFactory();
}

std::string Build(OEDataObj* root, OEBuildStringCrLfOpt crlf = OEBCL_CRLF, int* status = nullptr) {
    OEBuffer buffer(0, 4096);
    OEBuilder builder(crlf, 0);
    int s = builder.Build(&buffer, root, OEBSO_STRICT, 0, 0);
    if (status) *status = s;
    return std::string(buffer.GetBufferPtr() ? buffer.GetBufferPtr() : "", buffer.GetBufferSize());
}

OEParseStatus Parse(const std::string& text, OEDataObj* root) {
    OEBuffer buffer(0, 4096);
    buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    OESimpleParser parser;
    return parser.Parse(&buffer, root, 0, 0);
}

unsigned short CountLogged(OEParseWarning code) {
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    unsigned short n = 0;
    for (unsigned short i = 0; i < log->GetNumberParseExceptions(); ++i)
        n += log->GetParseException(i)->GetCode() == code;
    return n;
}

TEST(File, DefaultHeadersAndVersionChoice) {
    std::unique_ptr<OEFileRq> file(F()->NewFileRq(1));
    OERequest* rq = F()->NewRequest(1);
    file->AppendRequest(rq);
    EXPECT_EQ(Build(file.get()),
              "OFXHEADER:100\r\nDATA:OFXSGML\r\nVERSION:102\r\nSECURITY:NONE\r\nENCODING:USASCII\r\nCHARSET:"
              "1252\r\n"
              "COMPRESSION:NONE\r\nOLDFILEUID:NONE\r\nNEWFILEUID:NONE\r\n\r\n<OFX>\n</OFX>\n");
    file->SetMFAHeaderRequired(1);
    EXPECT_NE(Build(file.get()).find("VERSION:103\r\n"), std::string::npos);
    std::unique_ptr<OEFileRq> v2(F()->NewFileRq(2));
    EXPECT_NE(Build(v2.get()).find("VERSION:151\r\n"), std::string::npos);
    v2->SetOmitHeaders(1);
    EXPECT_EQ(Build(v2.get()), "");

    std::unique_ptr<OEFileRs> rs(F()->NewFileRs(1));
    EXPECT_EQ(rs->AddDefaultOFXHeaders(2), 1);
    EXPECT_STREQ(rs->GetHeader(OEHT_VERSION)->c_str(), "151");
    EXPECT_EQ(rs->SetHeader(OEHT_CONTENTTYPE, "x"), 0) << "only 2 to 10 are OFX headers";
    EXPECT_EQ(rs->SetHeader(OEHT_SECURITY, "  "), 0);
}

TEST(File, ValidationIsDeliberatelyLenient) {
    struct Row {
        const char* headers;
        unsigned short acceptable;
        unsigned short badFormat;
    };
    const Row rows[] = {
        {"OFXHEADER:100\nDATA:ofxsgml\nVERSION:102\n", 1, 0}, // values are upper-cased first
        {"OFXHEADER:100\nDATA:OFXSGML\nVERSION:211\n", 1, 1}, // reported, tolerated
        {"OFXHEADER:100\nDATA:OFXSGML\nENCODING:EBCDIC\n", 0, 1},
        {"OFXHEADER:100\nDATA:XML\n", 0, 1},
        {"OFXHEADER:200\nCOMPRESSION:ZIP\n", 0, 2},
    };
    for (const Row& r : rows) {
        std::unique_ptr<OEFileRs> file(F()->NewFileRs(1));
        Parse(std::string(r.headers) + "\n<OFX></OFX>", file.get());
        OEParseLogger::TheOEParseLogger()->DeleteAll();
        EXPECT_EQ(file->ValidateHeaders(), r.acceptable) << r.headers;
        EXPECT_EQ(CountLogged(OEPW_BADFORMAT), r.badFormat) << r.headers;
        EXPECT_GT(CountLogged(OEPW_MISSINGTAG), 0) << "missing headers are reported too";
    }
    std::unique_ptr<OEFileRs> headerless(F()->NewFileRs(1));
    Parse("<OFX></OFX>", headerless.get());
    EXPECT_EQ(headerless->AllRequiredPresent(), 0) << "no OFXHEADER";
}

TEST(File, MimeHeadersBlankValuesAndElementsUnderTheFile) {
    std::unique_ptr<OEFileRs> file(F()->NewFileRs(1));
    EXPECT_EQ(Parse("CONTENT-TYPE:application/x-ofx\nOFXHEADER:100\nSECURITY:\n\n<OFX></OFX>", file.get()),
              OEPS_OK);
    ASSERT_EQ(file->GetNumMIMEHeaders(), 1);
    EXPECT_STREQ(file->GetMIMEHeader(static_cast<unsigned short>(0))->GetValue().c_str(),
                 "application/x-ofx");
    EXPECT_EQ(file->GetHeader(OEHT_CONTENTTYPE), nullptr);
    EXPECT_EQ(file->GetHeader(OEHT_SECURITY), nullptr) << "a blank value is ignored";
    EXPECT_NE(Build(file.get()).find("CONTENT-TYPE: application/x-ofx\r\n\r\nOFXHEADER:100"),
              std::string::npos);

    std::unique_ptr<OEFileRs> bad(F()->NewFileRs(1));
    EXPECT_EQ(Parse("OFXHEADER:100\n\n<TRNUID>5\n<OFX></OFX>", bad.get()), OEPS_INVALID);
    EXPECT_EQ(CountLogged(OEPW_INVALIDELEM), 1);
}

// A builder whose header lines fail, to see what each file kind does next.
class FailingHeaders : public OEBuilder {
public:
    OEBuildStatus AddHeader(OEHeaderTag, const OEString&) override { return OEBS_NOTEXTFORM; }
};

TEST(File, RequestFileWritesOnAfterHeaderFailureResponseFileStops) {
    std::unique_ptr<OEFileRq> rq(F()->NewFileRq(1));
    rq->AppendRequest(F()->NewRequest(1));
    std::unique_ptr<OEFileRs> rs(F()->NewFileRs(1));
    rs->AppendResponse(F()->NewResponse(1));
    OEBuffer rqText, rsText;
    FailingHeaders b1, b2;
    EXPECT_EQ(b1.Build(&rqText, rq.get(), OEBSO_STRICT, 0, 0), OEBS_NOTEXTFORM);
    EXPECT_EQ(b2.Build(&rsText, rs.get(), OEBSO_STRICT, 0, 0), OEBS_NOTEXTFORM);
    EXPECT_EQ(std::string(rqText.GetBufferPtr(), rqText.GetBufferSize()), "<OFX>\n</OFX>\n");
    EXPECT_EQ(rsText.GetBufferSize(), 0u);
}

} // namespace

namespace {

size_t Count(const std::string& text, const std::string& what) {
    size_t n = 0;
    for (size_t at = text.find(what); at != std::string::npos; at = text.find(what, at + 1)) ++n;
    return n;
}

// A part's own Build writes its header block into the part's text, and the outer file writes the
// part's headers (MIME, then OFX) again in front of that text, so a part's OFX header block comes
// out twice. A part given the omit-headers flag carries it once: its text is then the body alone,
// and content-length is the size of that body.
TEST(File, MultipartSubfilesGetTheirLengthAndType) {
    for (unsigned short omit : {0, 1}) {
        SCOPED_TRACE(omit);
        std::unique_ptr<OEFile> outer(F()->NewFile(1));
        outer->SetBoundary(OEString("XYZ"));
        outer->SetMIMEBody(OEString("trailer"));
        // A complete request: the part is built with the required check.
        std::unique_ptr<OEFileRq> part(F()->NewFileRq(1));
        part->AddDefaultOFXHeaders(1);
        part->SetOmitHeaders(omit);
        OERequest* rq = F()->NewRequest(1);
        part->AppendRequest(rq);
        OEMessageSetRq* signOnSet = F()->NewMessageSetRq(1);
        signOnSet->SetType(OETAG_SIGNONMSGSRQV1);
        rq->AppendMessageSet(signOnSet);
        OESignOnRq* signOn = F()->NewSignOnRq(1);
        signOn->SetDtClient(OEString("20240105"));
        signOn->SetLanguage(OEString("ENG"));
        signOn->SetAppId(OEString("QWIN"));
        signOn->SetAppVer(static_cast<unsigned short>(2700));
        signOn->SetUserKey(OEString("k"));
        signOnSet->SetSignOnRq(signOn);
        ASSERT_EQ(outer->AppendSubfile(part.get()), 1);
        ASSERT_EQ(outer->GetNumberOfSubfiles(), 1);
        EXPECT_NE(outer->GetSubfile(0), part.get()) << "the file keeps a copy";
        int status = -1;
        std::string text = Build(outer.get(), OEBCL_CRLF, &status);
        EXPECT_EQ(status, OEBS_OK);
        OEFile* stored = outer->GetSubfile(0);
        OEString lengthName("content-length"), typeName("content-type");
        ASSERT_NE(stored->GetMIMEHeader(&lengthName), nullptr);
        ASSERT_NE(stored->GetMIMEHeader(&typeName), nullptr);
        EXPECT_STREQ(stored->GetMIMEHeader(&typeName)->GetValue().c_str(), "application/x-ofx");
        EXPECT_EQ(text.rfind("--XYZ\n", 0), 0u) << text;
        EXPECT_NE(text.find("trailer\n--XYZ--\n"), std::string::npos);
        EXPECT_EQ(Count(text, "OFXHEADER:100"), omit ? 1u : 2u) << text;
        EXPECT_EQ(Count(text, "content-length: "), 1u);
        if (omit) {
            // The length counts the part's body: from the blank line after its OFX headers to
            // the end of the part.
            size_t mimeEnd = text.find("\r\n\r\n") + 4;
            size_t body = text.find("\r\n\r\n", mimeEnd) + 4, end = text.find("trailer\n");
            EXPECT_STREQ(stored->GetMIMEHeader(&lengthName)->GetValue().c_str(),
                         std::to_string(end - body).c_str());
        }
    }
}

TEST(File, DisconnectHandsObjectsBack) {
    std::unique_ptr<OEMessageSetRq> set(F()->NewMessageSetRq(1));
    set->SetType(OETAG_BANKMSGSRQV1);
    OETransRq* a = F()->NewTransRq(1);
    a->SetType(OETAG_STMTTRNRQ);
    OESyncRq* sync = F()->NewSyncRq(1);
    sync->SetType(OETAG_INTRASYNCRQ);
    EXPECT_EQ(set->SetSync(1, sync), 0) << "beyond the count";
    EXPECT_EQ(set->SetSync(0, sync), 1) << "equal to the count appends";
    EXPECT_EQ(set->AppendTrans(a), 1);
    EXPECT_EQ(set->ValidateTag(OETAG_INTRASYNCRQ), 1);
    std::unique_ptr<OETransRq> back(set->DisconnectTrans(0));
    EXPECT_EQ(back.get(), a);
    EXPECT_EQ(set->GetNumTrans(), 0);
    EXPECT_EQ(set->ValidateTag(OETAG_STMTTRNRQ), 0);
    std::unique_ptr<OESyncRq> syncBack(set->DisconnectSync(0));
    EXPECT_EQ(syncBack.get(), sync);
    EXPECT_EQ(set->DisconnectSync(0), nullptr);

    std::unique_ptr<OETransRs> rs(F()->NewTransRs(1));
    rs->SetType(OETAG_STMTTRNRS);
    OEBankStatementRs* inner = F()->NewBankStatementRs(1);
    EXPECT_EQ(rs->SetActualTrans(inner), 1);
    EXPECT_EQ(rs->ValidateTag(OETAG_STMTRS), 1);
    std::unique_ptr<OETransBase> innerBack(rs->DisconnectActualTrans());
    EXPECT_EQ(innerBack.get(), inner);
    EXPECT_EQ(rs->ValidateTag(OETAG_STMTRS), 0);
}

} // namespace
