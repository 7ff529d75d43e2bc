// The security list: real files' SECLIST parses into typed descriptions that read as written and
// writes back in the order read, in either form; the message set routes, copies and checks it; the
// rules of SECRQ, OPTTYPE and COUPONFREQ; the request and the empty response of SECLISTTRNRQ/RS.
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <vector>

using namespace msgtest;

namespace {

OEDataObjFactory* F() {
    return OEDataObj::GetFactory();
}

std::string Corpus() {
    return OESDK_CORPUS_DIR;
}

// The investment statement of these files has no classes yet, and a start tag that its wrapper
// accepts but cannot make stops the parse; so it is cut out and the rest read as it stands.
std::string WithoutInvestmentStatement(std::string text) {
    size_t from = text.find("<INVSTMTMSGSRSV1>");
    size_t to = text.find("</INVSTMTMSGSRSV1>");
    if (from != std::string::npos && to != std::string::npos && to > from)
        text.erase(from, to + std::strlen("</INVSTMTMSGSRSV1>") - from);
    return text;
}

OESecList* FindSecList(OEFileRs* file) {
    for (unsigned short r = 0; r < file->GetNumberOfResponse(); ++r)
        for (unsigned short m = 0; m < file->GetResponse(r)->GetNumMessageSet(); ++m)
            if (OESecList* list = file->GetResponse(r)->GetMessageSet(m)->GetSecList()) return list;
    return nullptr;
}

// One line per security, from the typed accessors: kind, id, name, then what is present.
struct Line {
    std::string text;
    bool canonical;
    void Add(const char* key, const OEString* v) {
        if (v) text += std::string(" ") + key + "=" + v->c_str();
    }
    // An amount as the file wrote it, or in the canonical form the builder writes (35.00 is 35).
    void Add(const char* key, const OEPrecisionInteger* v) {
        if (!v) return;
        OEString s;
        OEPrecisionInteger copy(*v);
        if (canonical)
            s = static_cast<char*>(copy);
        else
            OEAggregate::AmountText(*v, s);
        text += std::string(" ") + key + "=" + s.c_str();
    }
    void Add(const char* key, const OEDateTime* v) {
        OEString s;
        if (v && v->GetDateString(s)) text += std::string(" ") + key + "=" + s.c_str();
    }
    void Add(const char* key, unsigned short (*conv)(int, OEString&), bool present, int v) {
        OEString s;
        if (present && conv(v, s)) text += std::string(" ") + key + "=" + s.c_str();
    }
};

template <class E, unsigned short (*Conv)(E, OEString&)> unsigned short Keyword(int v, OEString& out) {
    return Conv(static_cast<E>(v), out);
}

std::string Describe(OESecurityInfo* s, bool canonical) {
    Line l{"", canonical};
    l.text = OETagDictionary::TheOETagDictionary()->GetTagString(s->GetType());
    OESecInfo* info = s->GetSecInfo();
    if (!info) return l.text + " (no SECINFO)";
    if (OESecID* id = info->GetSecID())
        l.text += std::string(" ") + id->GetUniqueId()->c_str() + "/" + id->GetUniqueIdType()->c_str();
    l.Add("name", info->GetSecName());
    l.Add("ticker", info->GetTicker());
    l.Add("fiid", info->GetFIId());
    l.Add("price", info->GetUnitPrice());
    l.Add("asof", info->GetDateAsOf());
    if (info->GetCurrency()) l.Add("cur", info->GetCurrency()->GetCurrencySymbol());
    l.Add("memo", info->GetMemo());
    if (auto* d = dynamic_cast<OEDebtInfo*>(s)) {
        l.Add("par", d->GetParValue());
        l.Add("debt", Keyword<OEDebtType, OEDataConversion::DebtTypeToString>, d->ValidateTag(OETAG_DEBTTYPE),
              d->GetDebtType());
    } else if (auto* m = dynamic_cast<OEMFInfo*>(s)) {
        l.Add("mf", Keyword<OEMFType, OEDataConversion::MFTypeToString>, m->ValidateTag(OETAG_MFTYPE),
              m->GetMFType());
    } else if (auto* o = dynamic_cast<OEOptInfo*>(s)) {
        l.Add("opt", Keyword<OEOptType, OEDataConversion::OptTypeToString>, o->ValidateTag(OETAG_OPTTYPE),
              o->GetOptType());
        l.Add("strike", o->GetStrikePrice());
        l.Add("expire", o->GetDateExpire());
        l.text += " shares=" + std::to_string(o->GetSharesPerContract());
        if (o->GetUnderlyingSecID()) l.Add("underlying", o->GetUnderlyingSecID()->GetUniqueId());
    } else if (auto* st = dynamic_cast<OEStockInfo*>(s)) {
        l.Add("stock", Keyword<OEStockType, OEDataConversion::StockTypeToString>,
              st->ValidateTag(OETAG_STOCKTYPE), st->GetStockType());
        l.Add("yield", st->GetYield());
    }
    l.Add("class", Keyword<OEAssetClass, OEDataConversion::AssetClassToString>,
          s->ValidateTag(OETAG_ASSETCLASS), s->GetAssetClass());
    return l.text;
}

std::vector<std::string> DescribeAll(OESecList* list, bool canonical = false) {
    std::vector<std::string> out;
    for (unsigned short i = 0; list && i < list->GetNumSecurity(); ++i)
        out.push_back(Describe(list->GetSecurity(i), canonical));
    return out;
}

// The kinds of the security descriptions in a text, in order.
std::string KindsInOrder(const std::string& text) {
    std::string kinds;
    for (size_t at = text.find("INFO>"); at != std::string::npos; at = text.find("INFO>", at + 1)) {
        size_t open = text.rfind('<', at);
        std::string tag = text.substr(open + 1, at + 4 - open - 1);
        if (tag != "SECINFO" && tag[0] != '/') kinds += tag + " ";
    }
    return kinds;
}

std::unique_ptr<OEFileRs> Parse(const std::string& text, OEParseStatus* status) {
    std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
    *status = ParseInto(text, file.get());
    return file;
}

struct CorpusCase {
    const char* file;
    unsigned short count;             // securities in the list
    std::vector<std::string> leading; // the first ones, read by hand
};

const CorpusCase kCorpus[] = {
    {"ofxparse/td_ameritrade.ofx",
     2, // SGML: a stock, then a bond (the order is kept)
     {"STOCKINFO 023135106/CUSIP name=Amazon.com, Inc. - Common Stock ticker=AMZN",
      "DEBTINFO 912810RW0/CUSIP name=US Treasury 2047 ticker=912810RW0 par=1000 debt=ZERO"}},
    {"ofxtools/invstmtrs.ofx",
     3, // XML: two stocks and an option on a third security
     {"STOCKINFO 123456789/CUSIP name=Acme Development, Inc. ticker=ACME fiid=1024 yield=10 class=SMALLSTOCK",
      "STOCKINFO 666678578/CUSIP name=Hackson Unlimited, Inc. ticker=HACK fiid=1027 yield=17 "
      "class=SMALLSTOCK",
      "OPTINFO 000342222/CUSIP name=Lucky Airlines Jan 97 Put ticker=LUAXX fiid=0013 opt=PUT strike=35.00 "
      "expire=20050121 shares=100 underlying=000342200 class=LARGESTOCK"}},
    {"ofxparse/vanguard.ofx",
     2, // SGML: mutual funds
     {"MFINFO 012345678/CUSIP name=Name of the security ticker=VFINX fiid=0122 price=54.0 memo=Price as of "
      "date based on closing price mf=OPENEND"}},
    {"ofxgo/401k_v203.ofx",
     1, // XML: a fund with a negative price and a zoned date
     {"MFINFO OAEL/CUSIP name=VANGUARD TARGET 2045 fiid=OAEL price=-281.3371623586104 "
      "asof=20170405160000.000[-4:EDT] memo=Market close as of 04/05/2017;VANGUARD TARGET 2045 mf=OTHER"}},
    {"ofxparse/fidelity.ofx",
     7, // SGML: currency inside SECINFO
     {"STOCKINFO G7945E105/CUSIP name=SEADRILL LTD USD2 ticker=SDRL asof=20120908033034.000[-4:EDT] cur=USD "
      "stock=COMMON"}},
    {"ofxparse/tiaacref.ofx", 6, {"OTHERINFO 333333200/CUSIP name=TIAA Real Estate ticker=QREARX"}},
    {"libofx/ofx-2.1.1-sect-13.12.ofx", 3, {}},
    {"ofxparse/investment_401k.ofx", 3, {}},
    {"ofxparse/vanguard401k.ofx", 1, {}},
    {"ofxparser-php/ofxdata-google.ofx", 1, {"STOCKINFO TSE:T/TICKER name=TELUS Corporation ticker=T"}},
};

TEST(SecListCorpus, ReadsAsWrittenAndRoundTripsInBothForms) {
    std::string probe;
    if (!ReadFile(Corpus() + "/CATALOG.tsv", probe)) GTEST_SKIP() << "corpus not found at " << Corpus();
    for (const CorpusCase& c : kCorpus) {
        SCOPED_TRACE(c.file);
        std::string text;
        ASSERT_TRUE(ReadFile(Corpus() + "/" + c.file, text));
        OEParseStatus status;
        std::unique_ptr<OEFileRs> file = Parse(WithoutInvestmentStatement(text), &status);
        ASSERT_TRUE(status == OEPS_OK || status == OEPS_WARNINGS) << "status " << status;
        for (unsigned short i = 0; i < LogCount(); ++i)
            EXPECT_NE(LogEntry(i)->GetCode(), OEPW_INVALIDAGG) << LogEntry(i)->GetText().c_str();
        OESecList* list = FindSecList(file.get());
        ASSERT_NE(list, nullptr);
        std::vector<std::string> read = DescribeAll(list);
        ASSERT_EQ(read.size(), c.count);
        for (size_t i = 0; i < c.leading.size(); ++i) EXPECT_EQ(read[i], c.leading[i]);
        for (unsigned short i = 0; i < list->GetNumSecurity(); ++i)
            EXPECT_EQ(list->GetSecurity(i)->AllRequiredPresent(), 1) << read[i];

        std::string canonical = BuildText(file.get());
        EXPECT_EQ(KindsInOrder(canonical), KindsInOrder(text)) << "written in the order read";
        for (unsigned short endTags : {0, 1}) {
            std::unique_ptr<OEFileRs> again = Parse(BuildText(file.get(), endTags), &status);
            EXPECT_TRUE(status == OEPS_OK || status == OEPS_WARNINGS) << "form " << endTags;
            EXPECT_EQ(BuildText(again.get()), canonical) << "form " << endTags;
            EXPECT_EQ(DescribeAll(FindSecList(again.get()), true), DescribeAll(list, true))
                << "form " << endTags;
        }
        // A deep copy of the whole response carries the list, each entry as its own kind.
        OEResponse* original = file->GetResponse(0);
        std::unique_ptr<OEResponse> copy(F()->NewResponse(0));
        ASSERT_EQ(copy->DeepCopyFrom(original), 1);
        EXPECT_EQ(BuildText(copy.get()), BuildText(original));
    }
}

const char kSecListSet[] =
    "<OFX><SECLISTMSGSRSV1><SECLIST><STOCKINFO><SECINFO><SECID><UNIQUEID>1<UNIQUEIDTYPE>CUSIP</SECID>"
    "<SECNAME>first</SECINFO></STOCKINFO></SECLIST>"
    "<SECLIST><MFINFO><SECINFO><SECID><UNIQUEID>2<UNIQUEIDTYPE>CUSIP</SECID><SECNAME>fund</SECINFO>"
    "<MFASSETCLASS><PORTION><ASSETCLASS>largestock<PERCENT>60</PORTION><PORTION><ASSETCLASS>INTLBOND"
    "<PERCENT>40</PORTION></MFASSETCLASS><FIMFASSETCLASS><FIPORTION><FIASSETCLASS>Growth<PERCENT>100"
    "</FIPORTION></FIMFASSETCLASS></MFINFO></SECLIST>"
    "<SECLISTTRNRS><TRNUID>7<STATUS><CODE>0<SEVERITY>INFO</STATUS><SECLISTRS></SECLISTRS></SECLISTTRNRS>"
    "</SECLISTMSGSRSV1></OFX>";

TEST(SecList, MessageSetRoutesReplacesAndWritesTheListAfterItsWrappers) {
    OEParseStatus status;
    std::unique_ptr<OEFileRs> file = Parse(kSecListSet, &status);
    EXPECT_EQ(status, OEPS_WARNINGS);
    ASSERT_EQ(LogCount(), 1);
    EXPECT_EQ(LogEntry(0)->GetCode(), OEPW_EXTRAAGG);
    EXPECT_EQ(LogEntry(0)->GetTag(), OETAG_SECLIST);
    OEMessageSetRs* set = file->GetResponse(0)->GetMessageSet(0);
    OESecList* list = set->GetSecList();
    ASSERT_NE(list, nullptr);
    ASSERT_EQ(list->GetNumSecurity(), 1) << "the second SECLIST replaced the first";
    EXPECT_EQ(set->GetNumberOfChildren(), 2);
    EXPECT_EQ(set->GetChild(1), list) << "the list is walked after the wrappers";
    EXPECT_NE(dynamic_cast<OESecListRs*>(set->GetTrans(0)->GetChild(1)), nullptr);
    EXPECT_EQ(set->AllRequiredPresent(), 1);

    auto* fund = dynamic_cast<OEMFInfo*>(list->GetSecurity(0));
    ASSERT_NE(fund, nullptr);
    ASSERT_EQ(fund->GetMFAssetClass()->GetNumPortion(), 2);
    EXPECT_EQ(fund->GetMFAssetClass()->GetPortion(0)->GetAssetClass(), OEAC_LARGESTOCK);
    EXPECT_EQ(fund->GetMFAssetClass()->GetPortion(1)->GetAssetClass(), OEAC_INTLBOND);
    EXPECT_STREQ(fund->GetFIMFAssetClass()->GetFIPortion(0)->GetFIAssetClass()->c_str(), "Growth");
    EXPECT_EQ(
        BuildText(set),
        "<SECLISTTRNRS>\n<TRNUID>7\n<STATUS>\n<CODE>0\n<SEVERITY>INFO\n</STATUS>\n<SECLISTRS>\n"
        "</SECLISTRS>\n</SECLISTTRNRS>\n<SECLIST>\n<MFINFO>\n<SECINFO>\n<SECID>\n<UNIQUEID>2\n"
        "<UNIQUEIDTYPE>CUSIP\n</SECID>\n<SECNAME>fund\n</SECINFO>\n<MFASSETCLASS>\n<PORTION>\n"
        "<ASSETCLASS>LARGESTOCK\n<PERCENT>60\n</PORTION>\n<PORTION>\n<ASSETCLASS>INTLBOND\n<PERCENT>40\n"
        "</PORTION>\n</MFASSETCLASS>\n<FIMFASSETCLASS>\n<FIPORTION>\n<FIASSETCLASS>Growth\n<PERCENT>100\n"
        "</FIPORTION>\n</FIMFASSETCLASS>\n</MFINFO>\n</SECLIST>\n");
}

TEST(SecList, SetterKeepsTheSignOnRuleAndOtherSetsRefuse) {
    std::unique_ptr<OEMessageSetRs> set(F()->NewMessageSetRs(1));
    set->SetType(OETAG_SECLISTMSGSRSV1);
    EXPECT_EQ(set->AllRequiredPresent(), 0);
    OESecList* list = F()->NewSecList(1);
    OEStockInfo* stock = F()->NewStockInfo(1);
    EXPECT_EQ(list->AppendSecurity(stock), 1);
    EXPECT_EQ(list->AppendSecurity(nullptr), 0);
    EXPECT_EQ(set->SetSecList(list), 1);
    EXPECT_EQ(set->AllRequiredPresent(), 1);
    EXPECT_EQ(set->SetSecList(nullptr), 1);
    EXPECT_EQ(set->GetSecList(), nullptr);
    EXPECT_EQ(set->AllRequiredPresent(), 1) << "a null list leaves the mark set";
    EXPECT_EQ(BuildText(set.get()), "");

    std::unique_ptr<OEMessageSetRs> bank(F()->NewMessageSetRs(1));
    bank->SetType(OETAG_BANKMSGSRSV1);
    std::unique_ptr<OESecList> kept(F()->NewSecList(1));
    EXPECT_EQ(bank->SetSecList(kept.get()), 0);
    EXPECT_EQ(bank->GetSecList(), nullptr);
}

TEST(SecList, ElementRules) {
    struct Freq {
        const char* text;
        unsigned short ok;
        OECouponFreq value;
        const char* written;
    };
    const Freq freqs[] = {{"SEMIANNUAL", 1, OECF_SEMIANNUAL, "SEMIANNUAL"},
                          {"SemiAnnually", 1, OECF_SEMIANNUAL, "SEMIANNUALLY"},
                          {"ANUALLY", 1, OECF_ANNUAL, "ANUALLY"},
                          {"BIWEEKLY", 0, OECF_MONTHLY, nullptr}};
    for (const Freq& f : freqs) {
        SCOPED_TRACE(f.text);
        std::unique_ptr<OEDebtInfo> debt(F()->NewDebtInfo(1));
        EXPECT_EQ(debt->SetCouponFreq(OEString(f.text)), f.ok);
        EXPECT_EQ(debt->ValidateTag(OETAG_COUPONFREQ), f.ok);
        EXPECT_EQ(debt->GetCouponFreq(), f.value);
        std::string expected = f.written ? std::string("<COUPONFREQ>") + f.written + "\n" : "";
        EXPECT_EQ(BuildText(debt.get()), expected);
    }

    std::unique_ptr<OEOptInfo> opt(F()->NewOptInfo(1));
    EXPECT_EQ(opt->SetOptType(OEString("OTHER")), 0) << "an option is a call or a put";
    EXPECT_EQ(opt->SetOptType(OEOT_OTHER), 0);
    EXPECT_EQ(opt->SetOptType(OEString("call")), 1);
    EXPECT_EQ(opt->GetOptType(), OEOT_CALL);
    EXPECT_EQ(opt->SetSharesPerContract(OEString("99999")), 1) << "five digits";

    // MEMO belongs to version 1, MEMO2 to version 2.
    std::unique_ptr<OESecInfo> v1(F()->NewSecInfo(1)), v2(F()->NewSecInfo(2));
    EXPECT_EQ(v1->SetMemo2(OEString("m")), 0);
    EXPECT_EQ(v2->SetMemo(OEString("m")), 0);
    EXPECT_EQ(v2->SetMemo2(OEString("m")), 1);

    // SECRQ names its security by exactly one of SECID, TICKER and FIID.
    struct Rq {
        bool id, ticker, fiid;
        unsigned short complete;
    };
    for (const Rq& r : {Rq{true, false, false, 1}, Rq{false, true, false, 1}, Rq{false, false, false, 0},
                        Rq{false, true, true, 0}, Rq{true, false, true, 0}}) {
        std::unique_ptr<OESecRq> rq(F()->NewSecRq(1));
        if (r.id) rq->SetSecID(F()->NewSecID(1));
        if (r.ticker) rq->SetTicker(OEString("ACME"));
        if (r.fiid) rq->SetFIId(OEString("17"));
        EXPECT_EQ(rq->AllRequiredPresent(), r.complete) << r.id << r.ticker << r.fiid;
    }
}

TEST(SecList, RequestWrapperMakesTheListRequest) {
    const char* text =
        "<OFX><SECLISTMSGSRQV1><SECLISTTRNRQ><TRNUID>9<SECLISTRQ><SECRQ><TICKER>ACME</SECRQ>"
        "<SECRQ><SECID><UNIQUEID>1<UNIQUEIDTYPE>CUSIP</SECID></SECRQ></SECLISTRQ></SECLISTTRNRQ>"
        "</SECLISTMSGSRQV1></OFX>";
    std::unique_ptr<OEFileRq> file(F()->NewFileRq(1));
    EXPECT_EQ(ParseInto(text, file.get()), OEPS_OK);
    OEMessageSetRq* set = file->GetRequest(0)->GetMessageSet(0);
    auto* rq = dynamic_cast<OESecListRq*>(set->GetTrans(0)->GetChild(0));
    ASSERT_NE(rq, nullptr);
    ASSERT_EQ(rq->GetNumSecRq(), 2);
    EXPECT_STREQ(rq->GetSecRq(0)->GetTicker()->c_str(), "ACME");
    EXPECT_STREQ(rq->GetSecRq(1)->GetSecID()->GetUniqueId()->c_str(), "1");
    EXPECT_EQ(set->AllRequiredPresent(), 1);
}

int g_left = 0;
int FailAfterN(std::size_t) {
    return g_left-- > 0 ? 0 : 1;
}

// Failing the n-th allocation of a parse or a deep copy, for a range of n: a status, never a crash or
// a leak; a copy that reports success with no error recorded is whole.
TEST(SecList, RunningOutOfMemoryInAParseOrACopyIsReported) {
    OEParseStatus status;
    std::unique_ptr<OEFileRs> whole = Parse(kSecListSet, &status);
    OEResponse* source = whole->GetResponse(0);
    for (int allowed = 0; allowed < 240; allowed += 3) {
        std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
        std::unique_ptr<OEResponse> copy(F()->NewResponse(0));
        OEMemory::FailureHook previous = OEMemory::SetFailureHook(&FailAfterN);
        g_left = allowed;
        status = ParseInto(kSecListSet, file.get());
        OEThreadState::SetErrorCode(OETE_NONE);
        g_left = allowed;
        unsigned short copied = copy->DeepCopyFrom(source);
        OEMemory::SetFailureHook(previous);
        EXPECT_TRUE(status == OEPS_NORESOURCE || status == OEPS_WARNINGS || status == OEPS_INVALID)
            << allowed << ": " << status;
        if (copied && OEThreadState::GetErrorCode() == OETE_NONE) {
            EXPECT_EQ(BuildText(copy.get()), BuildText(source)) << allowed;
        }
        OEThreadState::SetErrorCode(OETE_NONE);
    }
}

} // namespace
