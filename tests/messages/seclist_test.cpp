// The security list: real files' SECLIST reads as written and is written back in the order read, in
// either form; the message set routes, copies and checks it; SECRQ, OPTTYPE and COUPONFREQ rules.
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

using namespace msgtest;

namespace {

const std::string kCorpusDir = OESDK_CORPUS_DIR;

// The investment statements of the corpus files have no classes yet, and a start tag that a wrapper
// accepts but cannot make stops the parse; so that set is cut out and the rest read as it stands.
std::unique_ptr<OEFileRs> Parse(std::string text, OEParseStatus* status) {
    size_t from = text.find("<INVSTMTMSGSRSV1>"), to = text.find("</INVSTMTMSGSRSV1>");
    if (from != std::string::npos && to != std::string::npos)
        text.erase(from, to + sizeof("</INVSTMTMSGSRSV1>") - 1 - from);
    std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
    *status = ParseInto(text, file.get());
    return file;
}

OESecList* FindSecList(OEFileRs* file) {
    OEResponse* rs = file->GetNumberOfResponse() ? file->GetResponse(0) : nullptr;
    for (unsigned short m = 0; rs && m < rs->GetNumMessageSet(); ++m)
        if (OESecList* list = rs->GetMessageSet(m)->GetSecList()) return list;
    return nullptr;
}

// One line per security, from the typed accessors: kind, id, then what is present.
std::string Describe(OESecurityInfo* s) {
    std::string out = OETagDictionary::TheOETagDictionary()->GetTagString(s->GetType());
    auto add = [&out](const char* key, const OEString& v) {
        out += std::string(" ") + key + "=" + v.c_str();
    };
    auto text = [&](const char* key, const OEString* v) {
        if (v) add(key, *v);
    };
    auto amount = [&](const char* key, const OEPrecisionInteger* v) {
        OEString t;
        if (v) OEAggregate::AmountText(*v, t), add(key, t);
    };
    auto date = [&](const char* key, const OEDateTime* v) {
        OEString t;
        if (v && v->GetDateString(t)) add(key, t);
    };
    auto keyword = [&](const char* key, OETagID tag, auto conv, auto value) {
        OEString t;
        if (s->ValidateTag(tag) && conv(value, t)) add(key, t);
    };
    OESecInfo* info = s->GetSecInfo();
    if (!info || !info->GetSecID()) return out + " (no SECINFO)";
    out += std::string(" ") + info->GetSecID()->GetUniqueId()->c_str() + "/" +
           info->GetSecID()->GetUniqueIdType()->c_str();
    text("name", info->GetSecName());
    text("ticker", info->GetTicker());
    text("fiid", info->GetFIId());
    amount("price", info->GetUnitPrice());
    date("asof", info->GetDateAsOf());
    if (info->GetCurrency()) text("cur", info->GetCurrency()->GetCurrencySymbol());
    text("memo", info->GetMemo());
    if (auto* d = dynamic_cast<OEDebtInfo*>(s)) {
        amount("par", d->GetParValue());
        keyword("debt", OETAG_DEBTTYPE, OEDataConversion::DebtTypeToString, d->GetDebtType());
    } else if (auto* o = dynamic_cast<OEOptInfo*>(s)) {
        keyword("opt", OETAG_OPTTYPE, OEDataConversion::OptTypeToString, o->GetOptType());
        amount("strike", o->GetStrikePrice());
        date("expire", o->GetDateExpire());
        out += " shares=" + std::to_string(o->GetSharesPerContract());
        if (o->GetUnderlyingSecID()) text("underlying", o->GetUnderlyingSecID()->GetUniqueId());
    }
    if (auto* m = dynamic_cast<OEMFInfo*>(s))
        keyword("mf", OETAG_MFTYPE, OEDataConversion::MFTypeToString, m->GetMFType());
    if (auto* st = dynamic_cast<OEStockInfo*>(s))
        keyword("stock", OETAG_STOCKTYPE, OEDataConversion::StockTypeToString, st->GetStockType());
    amount("yield", s->GetYield());
    keyword("class", OETAG_ASSETCLASS, OEDataConversion::AssetClassToString, s->GetAssetClass());
    return out;
}

std::vector<std::string> DescribeAll(OESecList* list) {
    std::vector<std::string> out;
    for (unsigned short i = 0; list && i < list->GetNumSecurity(); ++i)
        out.push_back(Describe(list->GetSecurity(i)));
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

// How many securities each file lists, and the first ones as read by hand.
struct CorpusCase {
    const char* file;
    unsigned short count;
    std::vector<std::string> leading;
};

const CorpusCase kCorpus[] = {
    // SGML: a stock, then a bond (the order is kept)
    {"ofxparse/td_ameritrade.ofx",
     2,
     {"STOCKINFO 023135106/CUSIP name=Amazon.com, Inc. - Common Stock ticker=AMZN",
      "DEBTINFO 912810RW0/CUSIP name=US Treasury 2047 ticker=912810RW0 par=1000 debt=ZERO"}},
    // XML: two stocks and an option on a third security
    {"ofxtools/invstmtrs.ofx",
     3,
     {"STOCKINFO 123456789/CUSIP name=Acme Development, Inc. ticker=ACME fiid=1024 yield=10 class=SMALLSTOCK",
      "STOCKINFO 666678578/CUSIP name=Hackson Unlimited, Inc. ticker=HACK fiid=1027 yield=17 "
      "class=SMALLSTOCK",
      "OPTINFO 000342222/CUSIP name=Lucky Airlines Jan 97 Put ticker=LUAXX fiid=0013 opt=PUT strike=35.00 "
      "expire=20050121 shares=100 underlying=000342200 class=LARGESTOCK"}},
    {"ofxparse/vanguard.ofx",
     2, // SGML: mutual funds
     {"MFINFO 012345678/CUSIP name=Name of the security ticker=VFINX fiid=0122 price=54.0 memo=Price as of "
      "date based on closing price mf=OPENEND"}},
    // XML: a fund with a negative price and a zoned date
    {"ofxgo/401k_v203.ofx",
     1,
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
    if (!ReadFile(kCorpusDir + "/CATALOG.tsv", probe)) GTEST_SKIP() << "corpus not found at " << kCorpusDir;
    for (const CorpusCase& c : kCorpus) {
        SCOPED_TRACE(c.file);
        std::string text;
        ASSERT_TRUE(ReadFile(kCorpusDir + "/" + c.file, text));
        OEParseStatus status;
        std::unique_ptr<OEFileRs> file = Parse(text, &status);
        ASSERT_TRUE(status == OEPS_OK || status == OEPS_WARNINGS) << "status " << status;
        for (unsigned short i = 0; i < LogCount(); ++i) EXPECT_NE(LogEntry(i)->GetCode(), OEPW_INVALIDAGG);
        OESecList* list = FindSecList(file.get());
        std::vector<std::string> read = DescribeAll(list);
        ASSERT_EQ(read.size(), c.count);
        read.resize(c.leading.size());
        EXPECT_EQ(read, c.leading);
        for (unsigned short i = 0; i < c.count; ++i) EXPECT_EQ(list->GetSecurity(i)->AllRequiredPresent(), 1);

        EXPECT_EQ(KindsInOrder(BuildText(file.get())), KindsInOrder(text)) << "written in the order read";
        // A deep copy carries the list, each entry as its own kind.
        ExpectRoundTrips(
            file.get(), [] { return std::unique_ptr<OEFileRs>(F()->NewFileRs(0)); }, true);
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
    EXPECT_EQ(set->AllRequiredPresent(), 1);

    OEMFAssetClass* mix = static_cast<OEMFInfo*>(list->GetSecurity(0))->GetMFAssetClass();
    ASSERT_EQ(mix->GetNumPortion(), 2);
    EXPECT_EQ(mix->GetPortion(1)->GetAssetClass(), OEAC_INTLBOND);
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
    EXPECT_EQ(list->AppendSecurity(F()->NewStockInfo(1)), 1);
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
    std::unique_ptr<OEFileRq> file(F()->NewFileRq(1));
    EXPECT_EQ(ParseInto("<OFX><SECLISTMSGSRQV1><SECLISTTRNRQ><TRNUID>9<SECLISTRQ><SECRQ><TICKER>ACME</SECRQ>"
                        "<SECRQ><FIID>7</SECRQ></SECLISTRQ></SECLISTTRNRQ></SECLISTMSGSRQV1></OFX>",
                        file.get()),
              OEPS_OK);
    auto* rq = dynamic_cast<OESecListRq*>(file->GetRequest(0)->GetMessageSet(0)->GetTrans(0)->GetChild(0));
    ASSERT_NE(rq, nullptr);
    ASSERT_EQ(rq->GetNumSecRq(), 2);
    EXPECT_STREQ(rq->GetSecRq(1)->GetFIId()->c_str(), "7");
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
        OEThreadState::SetErrorCode(OETE_NONE);
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
    }
    OEThreadState::SetErrorCode(OETE_NONE);
}

} // namespace
