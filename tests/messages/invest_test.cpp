// Investment statements: real files read as written (checked by hand against the files) and are
// written back the same in either form, kinds in document order; request building and the rules
// of the shared blocks.
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

using namespace msgtest;

namespace {

OEDataObjFactory* F() {
    return OEDataObj::GetFactory();
}
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

        std::string canonical = BuildText(file.get());
        EXPECT_EQ(KindsInOrder(canonical, "INVTRANLIST", kTxKinds),
                  KindsInOrder(text, "INVTRANLIST", kTxKinds));
        EXPECT_EQ(KindsInOrder(canonical, "INVPOSLIST", kPosKinds),
                  KindsInOrder(text, "INVPOSLIST", kPosKinds));
        for (unsigned short endTags : {0, 1}) {
            std::unique_ptr<OEFileRs> again(F()->NewFileRs(0));
            OEParseStatus status = ParseInto(BuildText(file.get(), endTags), again.get());
            EXPECT_TRUE(status == OEPS_OK || status == c.status) << "form " << endTags;
            EXPECT_EQ(BuildText(again.get()), canonical) << "form " << endTags;
        }
        std::unique_ptr<OEResponse> copy(F()->NewResponse(0));
        ASSERT_EQ(copy->DeepCopyFrom(file->GetResponse(0)), 1);
        EXPECT_EQ(BuildText(copy.get()), BuildText(file->GetResponse(0)));
    }
}

} // namespace
