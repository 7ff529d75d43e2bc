// Statement-end, challenge and profile aggregates and the multiple interbank wrappers: each one
// parsed inside its wrapper is made as its own class, writes the text it was given, and survives a
// round trip in both forms; a bank's real profile response does the same.
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <cstring>
#include <functional>
#include <memory>

using namespace msgtest;

namespace {

std::string Str(const OEString* s) {
    return s ? s->c_str() : "(none)";
}
std::string Date(const OEDateTime* d) {
    OEString out;
    if (d) d->GetDateString(out);
    return out.c_str();
}

const char kHeader[] = "OFXHEADER:100\nDATA:OFXSGML\nVERSION:102\n\n";
const char kSignOnRq[] =
    "<SIGNONMSGSRQV1>\n<SONRQ>\n<DTCLIENT>20240105\n<USERID>u\n<USERPASS>p\n<LANGUAGE>ENG\n"
    "<APPID>QWIN\n<APPVER>2700\n</SONRQ>\n</SIGNONMSGSRQV1>\n";
const char kSignOnRs[] = "<SIGNONMSGSRSV1>\n<SONRS>\n<STATUS>\n<CODE>0\n<SEVERITY>INFO\n</STATUS>\n"
                         "<DTSERVER>20240105\n<LANGUAGE>ENG\n</SONRS>\n</SIGNONMSGSRSV1>\n";

// A whole document holding one wrapper with one inner aggregate, or none when `inner` is empty (a
// sign-on wrapper goes into the sign-on set, after SONRQ / SONRS).
std::string Document(bool request, const std::string& set, const std::string& wrapper,
                     const std::string& inner, const std::string& body) {
    std::string trn = "<" + wrapper + ">\n<TRNUID>1\n";
    if (!request) trn += "<STATUS>\n<CODE>0\n<SEVERITY>INFO\n</STATUS>\n";
    if (!inner.empty()) trn += "<" + inner + ">\n" + body + "</" + inner + ">\n";
    trn += "</" + wrapper + ">\n";
    std::string signOn = request ? kSignOnRq : kSignOnRs;
    // The sign-on set takes the version of the other set (a document is of one version).
    for (size_t at = signOn.find("V1>"); at != std::string::npos; at = signOn.find("V1>", at))
        signOn[++at] = set.back();
    if (set.compare(0, 6, "SIGNON") == 0)
        signOn.insert(signOn.rfind("</"), trn);
    else
        signOn += "<" + set + ">\n" + trn + "</" + set + ">\n";
    return std::string(kHeader) + "<OFX>\n" + signOn + "</OFX>\n";
}

// The inner aggregate of the document's one transaction wrapper, and the wrapper.
template <class Root, class Trans> OEDataObj* Inner(Root* root, OEAggregate*& wrapper) {
    for (unsigned short i = 0; root && i < root->GetNumMessageSet(); ++i)
        if (root->GetMessageSet(i)->GetNumTrans()) {
            Trans* trans = root->GetMessageSet(i)->GetTrans(0);
            wrapper = trans;
            return trans->GetActualTrans();
        }
    return nullptr;
}
OEDataObj* Inner(OEFile* file, bool request, OEAggregate*& wrapper) {
    if (request) return Inner<OERequest, OETransRq>(static_cast<OEFileRq*>(file)->GetRequest(0), wrapper);
    return Inner<OEResponse, OETransRs>(static_cast<OEFileRs*>(file)->GetResponse(0), wrapper);
}

std::unique_ptr<OEFile> NewFile(bool request, unsigned short version = 0) {
    return std::unique_ptr<OEFile>(request ? static_cast<OEFile*>(F()->NewFileRq(version))
                                           : static_cast<OEFile*>(F()->NewFileRs(version)));
}

struct ClassRow {
    bool request;
    const char* set;
    const char* wrapper;
    const char* inner;
    const char* body;         // as the builder writes it
    OETagID required;         // clearing this mark fails the required check
    bool (*made)(OEDataObj*); // the parse made the inner's own class
    std::function<void(OEDataObj*)> check;
};

template <class T> bool Is(OEDataObj* o) {
    return dynamic_cast<T*>(o) != nullptr;
}

const ClassRow kRows[] = {
    {true, "BANKMSGSRQV1", "STMTENDTRNRQ", "STMTENDRQ",
     "<BANKACCTFROM>\n<BANKID>011\n<ACCTID>42\n<ACCTTYPE>CHECKING\n</BANKACCTFROM>\n<DTSTART>20240101\n"
     "<DTEND>20240331\n",
     OETAG_BANKACCTFROM, &Is<OEStatementEndRq>, nullptr},
    {false, "BANKMSGSRSV1", "STMTENDTRNRS", "STMTENDRS",
     "<CURDEF>USD\n<BANKACCTFROM>\n<BANKID>011\n<ACCTID>42\n<ACCTTYPE>SAVINGS\n</BANKACCTFROM>\n"
     "<CLOSING>\n<FITID>C1\n<DTOPEN>20240101\n<DTCLOSE>20240131\n<DTNEXT>20240229\n<BALOPEN>100\n"
     "<BALCLOSE>150.25\n<BALMIN>90\n<DEPANDCREDIT>75\n<CHKANDDEB>-24.75\n<TOTALFEES>-1\n<TOTALINT>.5\n"
     "<DTPOSTSTART>20240101\n<DTPOSTEND>20240131\n<MKTGINFO>Thanks\n</CLOSING>\n"
     "<CLOSING>\n<FITID>C2\n<DTCLOSE>20240229\n<BALCLOSE>-3\n<DTPOSTSTART>20240201\n<DTPOSTEND>20240229\n"
     "<ORIGCURRENCY>\n<CURRATE>1.1\n<CURSYM>EUR\n</ORIGCURRENCY>\n</CLOSING>\n",
     OETAG_CURDEF, &Is<OEStatementEndRs>, nullptr},
    {true, "CREDITCARDMSGSRQV1", "CCSTMTENDTRNRQ", "CCSTMTENDRQ",
     "<CCACCTFROM>\n<ACCTID>4111\n</CCACCTFROM>\n<DTSTART>20240101\n", OETAG_CCACCTFROM,
     &Is<OECCStatementEndRq>, nullptr},
    {false, "CREDITCARDMSGSRSV1", "CCSTMTENDTRNRS", "CCSTMTENDRS",
     "<CURDEF>EUR\n<CCACCTFROM>\n<ACCTID>4111\n</CCACCTFROM>\n<CCCLOSING>\n<FITID>S1\n<DTCLOSE>20240131\n"
     "<BALCLOSE>-410.3\n<DTPMTDUE>20240225\n<MINPMTDUE>25\n<FINCHG>3.1\n<PAYANDCREDIT>200\n<PURANDADV>-610."
     "3\n"
     "<DEBADJ>0\n<CREDITLIMIT>5000\n<DTPOSTSTART>20240101\n<DTPOSTEND>20240131\n</CCCLOSING>\n",
     OETAG_CCACCTFROM, &Is<OECCStatementEndRs>, nullptr},
    {true, "SIGNONMSGSRQV1", "CHALLENGETRNRQ", "CHALLENGERQ", "<USERID>jo\n<FICERTID>cert-7\n", OETAG_USERID,
     &Is<OEChallengeRq>, nullptr},
    {false, "SIGNONMSGSRSV1", "CHALLENGETRNRS", "CHALLENGERS", "<USERID>jo\n<NONCE>n0nce\n<FICERTID>cert-7\n",
     OETAG_NONCE, &Is<OEChallengeRs>, nullptr},
    {true, "PROFMSGSRQV1", "PROFTRNRQ", "PROFRQ", "<CLIENTROUTING>MSGSET\n<DTPROFUP>19991231\n",
     OETAG_DTPROFUP, &Is<OEProfileRq>, nullptr},
    // Version 2: URL2, URLGETREDIRECT and PWTYPE belong to the later message sets.
    {false, "PROFMSGSRSV2", "PROFTRNRS", "PROFRS",
     "<MSGSETLIST>\n<PROFMSGSET>\n<PROFMSGSETV1>\n</PROFMSGSETV1>\n</PROFMSGSET>\n</MSGSETLIST>\n"
     "<SIGNONINFOLIST>\n<SIGNONINFO>\n<SIGNONREALM>R\n<MIN>6\n<MAX>12\n<CHARTYPE>ALPHAANDNUMERIC\n<CASESEN>"
     "N\n"
     "<SPECIAL>Y\n<SPACES>N\n<PINCH>Y\n<PWTYPE>HWTOKEN\n</SIGNONINFO>\n</SIGNONINFOLIST>\n"
     "<DTPROFUP>20240101\n<FINAME>Bank\n<ADDR1>1 Main\n<ADDR2>Floor "
     "2\n<CITY>Town\n<STATE>CA\n<POSTALCODE>90000\n"
     "<COUNTRY>USA\n<CSPHONE>555\n<URL2>https://bank.example/"
     "ofx\n<URLGETREDIRECT>Y\n<EMAIL>help@bank.example\n",
     OETAG_FINAME, &Is<OEProfileRs>,
     [](OEDataObj* o) {
         auto* rs = static_cast<OEProfileRs*>(o);
         EXPECT_EQ(rs->GetSignOnInfoList()->GetSignOnInfo(0)->AllRequiredPresent(), 1);
         EXPECT_NE(rs->GetMessageSetList()->GetMessageSetProfile(OETAG_PROFMSGSET), nullptr);
         rs->SetAddr3(OEString("Suite 9"));
         rs->ClearTag(OETAG_ADDR2);
         EXPECT_EQ(rs->AllRequiredPresent(), 0) << "ADDR3 only together with ADDR2";
         rs->SetAddr2(OEString("Floor 2"));
         rs->ClearTag(OETAG_ADDR3);
     }},
};

TEST(EnvelopeClasses, ParseReadWriteAndRoundTripInBothForms) {
    for (const ClassRow& r : kRows) {
        SCOPED_TRACE(r.inner);
        std::string text = Document(r.request, r.set, r.wrapper, r.inner, r.body);
        unsigned short version = static_cast<unsigned short>(r.set[std::strlen(r.set) - 1] - '0');
        std::unique_ptr<OEFile> file = NewFile(r.request, version);
        ASSERT_EQ(ParseInto(text, file.get()), OEPS_OK);
        OEAggregate* wrapper = nullptr;
        OEDataObj* inner = Inner(file.get(), r.request, wrapper);
        ASSERT_NE(inner, nullptr);
        ASSERT_TRUE(r.made(inner));
        if (r.check) r.check(inner);
        EXPECT_EQ(BuildText(inner), r.body);
        EXPECT_EQ(inner->AllRequiredPresent(), 1);
        EXPECT_EQ(wrapper->AllRequiredPresent(), 1);
        inner->ClearTag(r.required);
        EXPECT_EQ(inner->AllRequiredPresent(), 0);
        inner->SetTag(r.required);
        // A deep copy of the whole tree makes the same classes again.
        ExpectRoundTrips(file.get(), [&] { return NewFile(r.request, version); });
    }
}

TEST(MultiTransfer, WrappersAreMadeByTagAndKeepTheirRules) {
    // The interbank transfer requests have no class yet: an INTERRQ answers 4 as in the plain
    // wrapper. The wrapper itself is the multiple one, made by its tag.
    std::unique_ptr<OEFileRq> refused(F()->NewFileRq(2));
    EXPECT_EQ(ParseInto(Document(true, "INTERXFERMSGSRQV2", "MULTIINTERTRNRQ", "INTERRQ",
                                 "<XFERINFO>\n</XFERINFO>\n"),
                        refused.get()),
              OEPS_INVALID);
    std::unique_ptr<OEFileRq> file(F()->NewFileRq(2));
    ASSERT_EQ(ParseInto(Document(true, "INTERXFERMSGSRQV2", "MULTIINTERTRNRQ", "", ""), file.get()), OEPS_OK);
    auto* multi = dynamic_cast<OEMultiTransRq*>(file->GetRequest(0)->GetMessageSet(1)->GetTrans(0));
    ASSERT_NE(multi, nullptr);
    EXPECT_EQ(multi->GetNumInterRq(), 0);
    EXPECT_EQ(multi->AllRequiredPresent(), 0) << "one INTERRQ at least";
    EXPECT_EQ(BuildText(multi), "<TRNUID>1\n");
    // Until INTERRQ has a class, nothing else can stand in its list: the inner slot refuses too,
    // and the caller keeps what it offered.
    std::unique_ptr<OEProfileRq> stray(F()->NewProfileRq(2));
    EXPECT_EQ(multi->SetActualTrans(stray.get()), 0);
    std::unique_ptr<OEFileRq> copy(F()->NewFileRq(2));
    ASSERT_EQ(copy->DeepCopyFrom(file.get()), 1);
    EXPECT_NE(dynamic_cast<OEMultiTransRq*>(copy->GetRequest(0)->GetMessageSet(1)->GetTrans(0)), nullptr);

    // The response takes STATUS as the plain one does, and needs an INTERRS unless it is an error.
    std::unique_ptr<OEFileRs> rs(F()->NewFileRs(2));
    ASSERT_EQ(ParseInto(Document(false, "INTERXFERMSGSRSV2", "MULTIINTERTRNRS", "", ""), rs.get()), OEPS_OK);
    auto* multiRs = dynamic_cast<OEMultiTransRs*>(rs->GetResponse(0)->GetMessageSet(1)->GetTrans(0));
    ASSERT_NE(multiRs, nullptr);
    EXPECT_EQ(multiRs->AllRequiredPresent(), 0);
    multiRs->GetStatus()->SetSeverity(OESEV_ERROR);
    EXPECT_EQ(multiRs->AllRequiredPresent(), 1);
    EXPECT_EQ(BuildText(multiRs), "<TRNUID>1\n<STATUS>\n<CODE>0\n<SEVERITY>ERROR\n</STATUS>\n");
}

TEST(ProfileCorpus, ABanksProfileReadsAsWrittenAndRoundTrips) {
    std::string text;
    if (!ReadFile(std::string(OESDK_CORPUS_DIR) + "/ofxtools/profrs.ofx", text))
        GTEST_SKIP() << "corpus not found at " << OESDK_CORPUS_DIR;
    std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
    // Warnings: the vendor's own tags and the per-set extras the profile classes do not hold.
    ASSERT_EQ(ParseInto(text, file.get()), OEPS_WARNINGS);
    OEResponse* root = file->GetResponse(0);
    ASSERT_EQ(root->GetNumMessageSet(), 2);
    OEMessageSetRs* prof = root->GetMessageSet(0)->GetType() == OETAG_PROFMSGSRSV1 ? root->GetMessageSet(0)
                                                                                   : root->GetMessageSet(1);
    ASSERT_EQ(prof->GetNumTrans(), 1);
    auto* rs = dynamic_cast<OEProfileRs*>(prof->GetTrans(0)->GetActualTrans());
    ASSERT_NE(rs, nullptr);
    EXPECT_EQ(Str(rs->GetFIName()), "Ameritrade");
    EXPECT_EQ(Str(rs->GetAddr1()), "4211 So. 102nd Street");
    EXPECT_EQ(Str(rs->GetPostalCode()), "68127");
    EXPECT_EQ(Date(rs->GetDtProfUp()), "20040731120000");
    EXPECT_EQ(rs->AllRequiredPresent(), 1);
    OEMessageSetList* sets = rs->GetMessageSetList();
    ASSERT_NE(sets, nullptr);
    EXPECT_EQ(sets->GetNumberOfChildren(), 5)
        << "SIGNON, SIGNUP, INVSTMT, SECLIST, PROF; TAX1099 is not held";
    OEMessageSetVersion* v1 =
        sets->GetMessageSetProfile(OETAG_INVSTMTMSGSET)->GetMsgSetVersionObj(OETAG_INVSTMTMSGSETV1);
    ASSERT_NE(v1, nullptr);
    EXPECT_EQ(Str(v1->GetMessageSetCore()->GetSignOnRealm()), "AMERITRADE");
    OESignOnInfo* info = rs->GetSignOnInfoList()->GetSignOnInfo(0);
    ASSERT_NE(info, nullptr);
    EXPECT_EQ(info->GetMin(), 4);
    EXPECT_EQ(info->GetMax(), 32);
    EXPECT_EQ(info->GetCharType(), static_cast<unsigned short>(OECHT_ALPHAORNUMERIC));
    EXPECT_EQ(info->GetCaseSensitive(), 1);
    EXPECT_EQ(info->GetChangePinFirst(), 0);
    EXPECT_TRUE(info->ValidateTag(OETAG_CHGPINFIRST));
    ExpectRoundTrips(
        file.get(), [] { return std::unique_ptr<OEFileRs>(F()->NewFileRs(0)); }, true);
}

} // namespace
