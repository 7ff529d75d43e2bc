// Investment statements: real files read as written (checked by hand against the files) and are
// written back the same in either form, kinds in document order; request building and the rules
// of the shared blocks.
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

using namespace msgtest;

namespace {

const std::string kCorpusDir = OESDK_CORPUS_DIR;

std::string TagName(OETagID tag) {
    const char* name = OETagDictionary::TheOETagDictionary()->GetTagString(tag);
    return name ? name : "?";
}

OEInvStmtRs* FindStatement(OEFileRs* file) {
    OEResponse* rs = file->GetNumberOfResponse() ? file->GetResponse(0) : nullptr;
    for (unsigned short m = 0; rs && m < rs->GetNumMessageSet(); ++m) {
        OEMessageSetRs* set = rs->GetMessageSet(m);
        for (unsigned short t = 0; t < set->GetNumTrans(); ++t)
            if (auto* st = dynamic_cast<OEInvStmtRs*>(set->GetTrans(t)->GetActualTrans())) return st;
    }
    return nullptr;
}

// One line per entry from the typed accessors: kind, then what is present.
struct Line {
    std::string out;
    void Add(const char* key, const OEString* v) {
        if (v) out += std::string(" ") + key + "=" + v->c_str();
    }
    void Add(const char* key, const OEPrecisionInteger* v) {
        OEString t;
        if (v) OEAggregate::AmountText(*v, t), Add(key, &t);
    }
    void Add(const char* key, const OEDateTime* v) {
        OEString t;
        if (v && v->GetDateString(t)) Add(key, &t);
    }
};

std::string DescribeTx(OEAggregate* tx) {
    Line l{TagName(tx->GetType())};
    OEInvestmentTx* core = dynamic_cast<OEInvestmentTx*>(tx);
    if (auto* buy = dynamic_cast<OEBuyTrade*>(tx)) core = buy->GetTrade();
    if (auto* sell = dynamic_cast<OESellTrade*>(tx)) core = sell->GetTrade();
    if (auto* bank = dynamic_cast<OEInvBankTran*>(tx)) {
        if (OEBankStatementTx* s = bank->GetStatementTx()) l.Add("fitid", s->GetFITId());
        return l.out;
    }
    if (!core) return l.out + " (empty)";
    if (OEInvTran* t = core->GetInvTran()) l.Add("fitid", t->GetFITId()), l.Add("trade", t->GetDateTrade());
    if (OESecID* id = core->GetSecID()) l.Add("sec", id->GetUniqueId());
    l.Add("units", core->GetUnits());
    l.Add("price", core->GetUnitPrice());
    l.Add("total", core->GetTotal());
    if (core->ValidateTag(OETAG_INCOMETYPE)) l.out += " income=" + std::to_string(core->GetIncomeType());
    return l.out;
}

std::string DescribePos(OEPosition* p) {
    Line l{TagName(p->GetType())};
    OEInvPos* pos = p->GetInvPos();
    if (!pos) return l.out + " (empty)";
    if (pos->GetSecID()) l.Add("sec", pos->GetSecID()->GetUniqueId());
    l.Add("units", pos->GetUnits());
    l.Add("price", pos->GetUnitPrice());
    l.Add("value", pos->GetMarketValue());
    l.Add("asof", pos->GetDatePriceAsOf());
    return l.out;
}

std::string DescribeBal(OEInvBal* b) {
    Line l{"INVBAL"};
    if (!b) return "none";
    l.Add("cash", b->GetAvailCash());
    l.Add("margin", b->GetMarginBalance());
    l.Add("short", b->GetShortBalance());
    if (b->GetBalList()) l.out += " bals=" + std::to_string(b->GetBalList()->GetNumBalance());
    return l.out;
}

// The kinds of the entries of a list in a text, in order (end tags and the shared blocks skipped).
std::string KindsInOrder(const std::string& text, const char* listTag,
                         const std::vector<std::string>& kinds) {
    std::string found;
    size_t from = text.find(std::string("<") + listTag + ">");
    size_t to = text.find(std::string("</") + listTag + ">");
    for (size_t at = text.find('<', from); from != std::string::npos && at < to;
         at = text.find('<', at + 1)) {
        size_t end = text.find('>', at);
        std::string tag = text.substr(at + 1, end - at - 1);
        for (const std::string& k : kinds)
            if (tag == k) found += tag + " ";
    }
    return found;
}

const std::vector<std::string> kTxKinds = {
    "INVBANKTRAN", "BUYDEBT",    "BUYMF",    "BUYOPT",    "BUYOTHER",       "BUYSTOCK", "CLOSUREOPT",
    "INCOME",      "INVEXPENSE", "JRNLFUND", "JRNLSEC",   "MARGININTEREST", "REINVEST", "RETOFCAP",
    "SELLDEBT",    "SELLMF",     "SELLOPT",  "SELLOTHER", "SELLSTOCK",      "SPLIT",    "TRANSFER"};
const std::vector<std::string> kPosKinds = {"POSDEBT", "POSMF", "POSOPT", "POSOTHER", "POSSTOCK"};

struct CorpusCase {
    const char* file;
    OEParseStatus status; // OEPS_WARNINGS: unknown elements skipped, or odd values logged
    const char* account;
    unsigned short txCount, posCount;
    std::vector<std::string> tx;  // by hand: some transactions, "index: line"
    std::vector<std::string> pos; // by hand: some positions
    const char* balance;
};

const CorpusCase kCorpus[] = {
    {"ofxparse/fidelity.ofx", // SGML: buys, incomes, sells and bank transactions, zero-padded amounts
     OEPS_OK,
     "fidelity.com/01234567890",
     17,
     6,
     {"0: BUYSTOCK fitid=0123456789020201120120720 trade=20120720000000.000[-4:EDT] sec=458140100 "
      "units=100.00000 price=25.635000000 total=-2571.4500",
      "8: INCOME fitid=0123456789021301520120731 trade=20120731000000.000[-4:EDT] sec=78462F103 total=5.5300 "
      "income=2",
      "12: SELLSTOCK fitid=0123456789020901320120727 trade=20120727000000.000[-4:EDT] sec=78462F103 "
      "units=-8.00000 price=137.160000000 total=1089.3000",
      "14: INVBANKTRAN fitid=0123456789021301320120731"},
     {"0: POSSTOCK sec=G7945E105 units=128.00000 price=40.8700000 value=5231.36 "
      "asof=20120908033034.000[-4:EDT]"},
     "INVBAL cash=18073.98 margin=0.00 short=0.00 bals=18"},
    {"ofxparse/vanguard.ofx", // SGML: a fund sale
     OEPS_OK,
     "vanguard.com/01234567890",
     1,
     2,
     {"0: SELLMF fitid=01234567890.0123.07152011.0 trade=20110715160000.000[-5:EST] sec=012345678 "
      "units=-42.123 "
      "price=100.00 total=4212.3"},
     {"1: POSMF sec=012345678 units=142.2 price=100.42 value=14279.72 asof=20110726160000.000[-5:EST]"},
     "none"},
    {"ofxparse/td_ameritrade.ofx", // XML: a stock and a bond position, no transactions
     OEPS_OK,
     "ameritrade.com/121212121",
     0,
     2,
     {},
     {"1: POSDEBT sec=912810RW0 units=1000 price=100 value=1000 asof=20171203120000"},
     "INVBAL cash=0 margin=0 short=0 bals=13"},
    {"ofxparse/tiaacref.ofx", // SGML: a transfer and other positions
     OEPS_OK,
     "TIAA-CREF.ORG/111A1111 22B222 33C333",
     1,
     6,
     {"0: TRANSFER fitid=TIAA#20170307160000.000[-4:EDT]160000.000[-4:EDT] trade=20170307150000.000[-5:EST] "
      "sec=111111111 units=0 price=1"},
     {},
     "INVBAL cash=0 margin=0 short=0"},
    // The rest carry elements the dictionary does not know (skipped) or values logged as odd.
    {"ofxparse/investment_medium.ofx",
     OEPS_WARNINGS,
     "404/ABC123",
     3,
     0,
     {},
     {},
     "INVBAL cash=1.00 margin=0 short=0 bals=4"},
    {"ofxparse/investment_401k.ofx",
     OEPS_WARNINGS,
     "example.org/12345678.123456-01",
     3,
     3,
     {"0: BUYMF fitid=1 trade=20140617000000.000[-6:MDT] sec=FOO units=8.846699 price=22.2908 total=-197.2"},
     {},
     "none"},
    {"ofxparse/vanguard401k.ofx", OEPS_WARNINGS, "vanguard.com/0123456", 5, 1, {}, {}, "none"},
    {"ofxparse/fidelity-savings.ofx", OEPS_WARNINGS, "fidelity.com/X0000001", 4, 0, {}, {}, "none"},
    {"ofxgo/401k_v203.ofx", // XML
     OEPS_WARNINGS,
     "fi.example.com/79451753939",
     7,
     1,
     {},
     {},
     "INVBAL cash=3118 margin=2360 short=2408 bals=3"},
    // Two printings of the same sample statement, with one open order each.
    {"ofxtools/invstmtrs.ofx",
     OEPS_OK,
     "121099999/999988",
     2,
     2,
     {},
     {},
     "INVBAL cash=200.00 margin=-50.00 short=0 bals=1"},
    {"libofx/ofx-2.1.1-sect-13.12.ofx",
     OEPS_OK,
     "121099999/999988",
     2,
     2,
     {},
     {},
     "INVBAL cash=200.00 margin=-50.00 short=0 bals=1"},
};

TEST(InvestCorpus, ReadsAsWrittenAndRoundTripsInBothForms) {
    std::string probe;
    if (!ReadFile(kCorpusDir + "/CATALOG.tsv", probe)) GTEST_SKIP() << "corpus not found at " << kCorpusDir;
    for (const CorpusCase& c : kCorpus) {
        SCOPED_TRACE(c.file);
        std::string text;
        ASSERT_TRUE(ReadFile(kCorpusDir + "/" + c.file, text));
        std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
        EXPECT_EQ(ParseInto(text, file.get()), c.status);
        OEInvStmtRs* st = FindStatement(file.get());
        ASSERT_NE(st, nullptr);
        EXPECT_EQ(st->AllRequiredPresent(), 1);
        std::string account = std::string(st->GetAccountFrom()->GetBrokerId()->c_str()) + "/" +
                              st->GetAccountFrom()->GetAcctId()->c_str();
        EXPECT_EQ(account, c.account);
        OEInvTranList* txs = st->GetTranList();
        OEInvPosList* poss = st->GetPosList();
        EXPECT_EQ(txs ? txs->GetNumTransaction() : 0, c.txCount);
        EXPECT_EQ(poss ? poss->GetNumPosition() : 0, c.posCount);
        for (const std::string& line : c.tx) {
            unsigned short i = static_cast<unsigned short>(std::stoi(line));
            ASSERT_LT(i, c.txCount);
            EXPECT_EQ(std::to_string(i) + ": " + DescribeTx(txs->GetTransaction(i)), line);
            EXPECT_EQ(txs->GetTransaction(i)->AllRequiredPresent(), 1) << line;
        }
        for (const std::string& line : c.pos) {
            unsigned short i = static_cast<unsigned short>(std::stoi(line));
            ASSERT_LT(i, c.posCount);
            EXPECT_EQ(std::to_string(i) + ": " + DescribePos(poss->GetPosition(i)), line);
        }
        EXPECT_EQ(DescribeBal(st->GetInvBal()), c.balance);
        const bool hasOrders = text.find("<INVOOLIST>") != std::string::npos;
        EXPECT_EQ(st->GetOOList() ? st->GetOOList()->GetNumOpenOrder() : 0, hasOrders ? 1 : 0);

        std::string canonical = BuildText(file.get());
        EXPECT_EQ(KindsInOrder(canonical, "INVTRANLIST", kTxKinds),
                  KindsInOrder(text, "INVTRANLIST", kTxKinds));
        EXPECT_EQ(KindsInOrder(canonical, "INVPOSLIST", kPosKinds),
                  KindsInOrder(text, "INVPOSLIST", kPosKinds));
        ExpectRoundTrips(
            file.get(), [] { return std::unique_ptr<OEFileRs>(F()->NewFileRs(0)); },
            c.status == OEPS_WARNINGS);
    }
}

// A request made in code is written in element order, is complete only with its four required
// parts, and reads back into the same tree through its transaction wrapper.
TEST(Invest, RequestBuildsInOrderAndReadsBack) {
    std::unique_ptr<OEInvStmtRq> rq(F()->NewInvStmtRq(1));
    OEIncPos* pos = F()->NewIncPos(1);
    pos->SetInclude(static_cast<unsigned short>(1));
    rq->SetIncPos(pos);
    EXPECT_EQ(rq->SetIncludeFlag(OETAG_INCBAL, 1), 1);
    EXPECT_EQ(rq->SetIncludeFlag(OETAG_CURDEF, 1), 0) << "not a mark of the request";
    EXPECT_EQ(rq->AllRequiredPresent(), 0);
    OEInvAcctFrom* account = F()->NewInvAcctFrom(1);
    account->SetBrokerId(OEString("broker.example"));
    account->SetAcctId(OEString("A1"));
    rq->SetAccountFrom(account);
    rq->SetIncludeFlag(OETAG_INCOO, 0);
    EXPECT_EQ(rq->AllRequiredPresent(), 1);
    OEIncTransaction* inc = F()->NewIncTransaction(1);
    inc->SetInclude(static_cast<unsigned short>(1));
    inc->SetDateStart(OEString("20240101"));
    rq->SetIncTransaction(inc);
    const char kWritten[] =
        "<INVACCTFROM>\n<BROKERID>broker.example\n<ACCTID>A1\n</INVACCTFROM>\n<INCTRAN>\n"
        "<DTSTART>20240101\n<INCLUDE>Y\n</INCTRAN>\n<INCOO>N\n<INCPOS>\n<INCLUDE>Y\n</INCPOS>\n"
        "<INCBAL>Y\n";
    EXPECT_EQ(BuildText(rq.get()), kWritten);

    std::unique_ptr<OEFileRq> file(F()->NewFileRq(1));
    ASSERT_EQ(ParseInto(std::string("<OFX><INVSTMTMSGSRQV1><INVSTMTTRNRQ><TRNUID>9<INVSTMTRQ>") + kWritten +
                            "</INVSTMTRQ></INVSTMTTRNRQ></INVSTMTMSGSRQV1></OFX>",
                        file.get()),
              OEPS_OK);
    std::string text = BuildText(file.get());
    EXPECT_NE(text.find(std::string("<INVSTMTRQ>\n") + kWritten + "</INVSTMTRQ>"), std::string::npos) << text;
}

// A buy of another kind names its buy type from version 2 on.
TEST(Invest, OtherBuysTakeTheirBuyTypeFromVersionTwo) {
    std::unique_ptr<OEBuyOther> other1(F()->NewBuyOther(1)), other2(F()->NewBuyOther(2));
    EXPECT_EQ(other1->SetElement(OETAG_BUYTYPE, OEString("BUY")), 0);
    EXPECT_EQ(other2->SetElement(OETAG_BUYTYPE, OEString("BUYTOCOVER")), 1);
    EXPECT_EQ(other2->GetBuyType(), OEBUY_BUYTOCOVER);
}

// The lists take only their own kinds, keep the order of appending, and copy each entry as its kind.
TEST(Invest, MixedListsKeepOrderAndKinds) {
    std::unique_ptr<OEInvTranList> list(F()->NewInvTranList(1));
    list->SetDateStart(OEString("20240101"));
    list->SetDateEnd(OEString("20240201"));
    std::unique_ptr<OEInvPos> stray(F()->NewInvPos(1));
    EXPECT_EQ(list->AppendTransaction(stray.get()), 0) << "not a transaction: the caller keeps it";
    EXPECT_EQ(list->AppendTransaction(nullptr), 0);
    OESellOpt* sell = F()->NewSellOpt(1);
    sell->SetElement(OETAG_OPTSELLTYPE, OEString("SELLTOCLOSE"));
    OEIncome* income = F()->NewIncome(1);
    income->SetElement(OETAG_INCOMETYPE, OEString("CGLONG"));
    OEBuyStock* buy = F()->NewBuyStock(1);
    for (OEAggregate* tx : std::vector<OEAggregate*>{sell, income, buy})
        ASSERT_EQ(list->AppendTransaction(tx), 1);
    const char kWritten[] = "<DTSTART>20240101\n<DTEND>20240201\n<SELLOPT>\n<OPTSELLTYPE>SELLTOCLOSE\n"
                            "</SELLOPT>\n<INCOME>\n<INCOMETYPE>CGLONG\n</INCOME>\n<BUYSTOCK>\n</BUYSTOCK>\n";
    EXPECT_EQ(BuildText(list.get()), kWritten);
    EXPECT_EQ(list->GetNumberOfChildren(), 3);
    EXPECT_EQ(list->GetChild(1), income);

    std::unique_ptr<OEInvTranList> copy(F()->NewInvTranList(1));
    ASSERT_EQ(copy->DeepCopyFrom(list.get()), 1);
    EXPECT_EQ(BuildText(copy.get()), kWritten);
    EXPECT_NE(dynamic_cast<OESellOpt*>(copy->GetTransaction(0)), nullptr);

    list->DeleteAllTransaction();
    EXPECT_EQ(list->ValidateTag(OETAG_SELLOPT), 0);
    EXPECT_EQ(BuildText(list.get()), "<DTSTART>20240101\n<DTEND>20240201\n");

    // CURRENCY and ORIGCURRENCY share one slot in a transaction: setting one replaces the other.
    std::unique_ptr<OEIncome> tx(F()->NewIncome(1));
    OECurrency* orig = F()->NewCurrency(1);
    orig->SetType(OETAG_ORIGCURRENCY);
    ASSERT_EQ(tx->SetCurrency(orig), 1);
    EXPECT_EQ(tx->ValidateTag(OETAG_ORIGCURRENCY), 1);
    ASSERT_EQ(tx->SetCurrency(F()->NewCurrency(1)), 1);
    EXPECT_EQ(tx->ValidateTag(OETAG_ORIGCURRENCY), 0);
    EXPECT_EQ(tx->ValidateTag(OETAG_CURRENCY), 1);
}

// A statement cut short anywhere leaves a partial tree that still builds, copies and is freed.
TEST(InvestCorpus, TruncatedStatementsLeaveUsableTrees) {
    std::string text;
    if (!ReadFile(kCorpusDir + "/ofxparse/fidelity.ofx", text)) GTEST_SKIP() << "corpus not found";
    size_t from = text.find("<INVSTMTRS>");
    for (size_t cut = from; cut < text.size(); cut += 53) {
        std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
        ParseInto(text.substr(0, cut), file.get());
        ASSERT_EQ(file->GetNumberOfResponse(), 1) << cut;
        std::unique_ptr<OEResponse> copy(F()->NewResponse(0));
        ASSERT_EQ(copy->DeepCopyFrom(file->GetResponse(0)), 1) << cut;
        EXPECT_EQ(BuildText(copy.get()), BuildText(file->GetResponse(0))) << cut;
    }
}

} // namespace
