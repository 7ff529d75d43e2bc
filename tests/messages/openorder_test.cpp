// Open orders: the INVOOLIST blocks of real statements read as written and round-trip in both forms;
// every kind of order, mixed, keeps its document order and its own elements.
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <memory>

using namespace msgtest;

namespace {

const std::string kCorpusDir = OESDK_CORPUS_DIR;

// The parser hands the root the children of a block: what lies between <INVOOLIST> and its end tag.
std::unique_ptr<OEInvOOList> ParseList(const std::string& text, unsigned short version,
                                       OEParseStatus* status) {
    size_t from = text.find("<INVOOLIST>"), to = text.rfind("</INVOOLIST>");
    from = from == std::string::npos ? 0 : from + sizeof("<INVOOLIST>") - 1;
    std::unique_ptr<OEInvOOList> list(F()->NewInvOOList(version));
    *status =
        ParseInto(text.substr(from, to == std::string::npos ? std::string::npos : to - from), list.get());
    return list;
}

// One line per order, from the typed accessors: kind, the OO, then the kind's own elements.
std::string Describe(OEOpenOrder* order) {
    std::string out = OETagDictionary::TheOETagDictionary()->GetTagString(order->GetType());
    OEString t;
    auto amount = [&](const char* key, const OEPrecisionInteger* v) {
        if (v) OEAggregate::AmountText(*v, t), out += std::string(" ") + key + "=" + t.c_str();
    };
    auto number = [&](const char* key, OETagID tag, long v) {
        if (order->ValidateTag(tag)) out += std::string(" ") + key + "=" + std::to_string(v);
    };
    OEOO* oo = order->GetOO();
    if (!oo) return out + " (no OO)";
    if (oo->GetFITId()) out += std::string(" ") + oo->GetFITId()->c_str();
    if (oo->GetSecID()) out += std::string(" ") + oo->GetSecID()->GetUniqueId()->c_str();
    if (oo->GetDatePlaced() && oo->GetDatePlaced()->GetDateString(t)) out += std::string(" ") + t.c_str();
    amount("units", oo->GetUnits());
    out += " " + std::to_string(oo->GetSubAcct()) + std::to_string(oo->GetDuration()) +
           std::to_string(oo->GetRestriction());
    amount("min", oo->GetMinUnits());
    amount("limit", oo->GetLimitPrice());
    number("buy", OETAG_BUYTYPE, order->GetBuyType());
    number("sell", OETAG_SELLTYPE, order->GetSellType());
    number("unit", OETAG_UNITTYPE, order->GetUnitType());
    if (auto* d = dynamic_cast<OEOOBuyDebt*>(order)) number("auction", OETAG_AUCTION, d->GetAuction());
    if (auto* o = dynamic_cast<OEOOBuyOpt*>(order)) number("opt", OETAG_OPTBUYTYPE, o->GetOptBuyType());
    if (auto* o = dynamic_cast<OEOOSellOpt*>(order)) number("opt", OETAG_OPTSELLTYPE, o->GetOptSellType());
    if (auto* m = dynamic_cast<OEOOSellMF*>(order)) number("all", OETAG_SELLALL, m->GetSellAll());
    if (auto* s = dynamic_cast<OEOOSwitchMF*>(order)) {
        number("all", OETAG_SWITCHALL, s->GetSwitchAll());
        if (s->GetSecID()) out += std::string(" to=") + s->GetSecID()->GetUniqueId()->c_str();
    }
    return out;
}
std::string DescribeAll(OEInvOOList* list) {
    std::string out;
    for (unsigned short i = 0; i < list->GetNumOpenOrder(); ++i)
        out += Describe(list->GetOpenOrder(i)) + "\n";
    return out;
}

void ExpectRoundTrip(OEInvOOList* list, unsigned short version) {
    ExpectRoundTrips(list, [version] { return std::unique_ptr<OEInvOOList>(F()->NewInvOOList(version)); });
}

// Both corpus statements carry the same stock order (one of them with comments after each line).
TEST(OpenOrderCorpus, ReadsTheBlocksAsWrittenAndRoundTrips) {
    std::string probe;
    if (!ReadFile(kCorpusDir + "/CATALOG.tsv", probe)) GTEST_SKIP() << "corpus not found at " << kCorpusDir;
    for (const char* name : {"libofx/ofx-2.1.1-sect-13.12.ofx", "ofxtools/invstmtrs.ofx"}) {
        SCOPED_TRACE(name);
        std::string text;
        ASSERT_TRUE(ReadFile(kCorpusDir + "/" + name, text));
        size_t from = text.find("<INVOOLIST>"), to = text.find("</INVOOLIST>");
        ASSERT_NE(to, std::string::npos);
        OEParseStatus status;
        std::unique_ptr<OEInvOOList> list = ParseList(text.substr(from, to + 12 - from), 2, &status);
        ASSERT_EQ(status, OEPS_OK);
        EXPECT_EQ(DescribeAll(list.get()),
                  "OOBUYSTOCK 23321 666678578 20050624031505 units=100 012 limit=50.00 buy=0\n");
        EXPECT_EQ(list->GetOpenOrder(0)->AllRequiredPresent(), 1);
        EXPECT_EQ(list->GetOpenOrder(0)->GetOO()->AllRequiredPresent(), 1);
        ExpectRoundTrip(list.get(), 2);
    }
}

// One order of each kind, mixed so that no two kinds come in the order of the list's rows.
const char kOO[] = "<OO><FITID>%s<SECID><UNIQUEID>1234<UNIQUEIDTYPE>CUSIP</SECID><DTPLACED>20240102"
                   "<UNITS>10.5<SUBACCT>MARGIN<DURATION>DAY<RESTRICTION>MINUNITS<MINUNITS>5</OO>";
struct Kind {
    const char* tag;
    const char* extra; // what follows the OO
    const char* read;  // what Describe shows after the OO
};
const Kind kKinds[] = {
    {"OOSWITCHMF", "<SECID><UNIQUEID>987<UNIQUEIDTYPE>CUSIP</SECID><UNITTYPE>CURRENCY<SWITCHALL>Y",
     "unit=1 all=1 to=987"},
    {"OOSELLSTOCK", "<SELLTYPE>SELLSHORT", "sell=1"},
    {"OOBUYDEBT", "<AUCTION>Y<DTAUCTION>20240110", "auction=1"},
    {"OOSELLOTHER", "<UNITTYPE>SHARES", "unit=0"},
    {"OOBUYMF", "<BUYTYPE>BUYTOCOVER<UNITTYPE>SHARES", "buy=1 unit=0"},
    {"OOSELLDEBT", "", ""},
    {"OOBUYOPT", "<OPTBUYTYPE>BUYTOCLOSE", "opt=1"},
    {"OOSELLMF", "<SELLTYPE>SELL<UNITTYPE>CURRENCY<SELLALL>N", "sell=0 unit=1 all=0"},
    {"OOBUYOTHER", "<UNITTYPE>CURRENCY", "unit=1"},
    {"OOSELLOPT", "<OPTSELLTYPE>SELLTOOPEN", "opt=0"},
    {"OOBUYSTOCK", "<BUYTYPE>BUY", "buy=0"},
};

std::string Order(const Kind& k, const std::string& extra) {
    char oo[sizeof(kOO) + 16];
    std::snprintf(oo, sizeof(oo), kOO, k.tag);
    return std::string("<") + k.tag + ">" + oo + extra + "</" + k.tag + ">";
}
std::string AllKinds() {
    std::string text;
    for (const Kind& k : kKinds) text += Order(k, k.extra);
    return text;
}

TEST(OpenOrder, EveryKindMixedKeepsItsOrderElementsAndRoundTrips) {
    OEParseStatus status;
    std::unique_ptr<OEInvOOList> list = ParseList(AllKinds(), 1, &status);
    ASSERT_EQ(status, OEPS_OK);
    std::string expected;
    for (const Kind& k : kKinds)
        expected += std::string(k.tag) + " " + k.tag + " 1234 20240102 units=10.5 101 min=5" +
                    (*k.read ? " " : "") + k.read + "\n";
    EXPECT_EQ(DescribeAll(list.get()), expected);
    for (unsigned short i = 0; i < list->GetNumOpenOrder(); ++i)
        EXPECT_EQ(list->GetOpenOrder(i)->AllRequiredPresent(), 1) << kKinds[i].tag;
    EXPECT_EQ(list->GetOpenOrder(5)->GetNumberOfChildren(), 1) << "OOSELLDEBT holds only its OO";
    ExpectRoundTrip(list.get(), 1);
    // Each order is written in field order, whatever the order read.
    std::string sample = BuildText(list->GetOpenOrder(7));
    EXPECT_NE(sample.find("</OO>\n<SELLTYPE>SELL\n<UNITTYPE>CURRENCY\n<SELLALL>N\n"), std::string::npos)
        << sample;
}

TEST(OpenOrder, KindsAndBadValues) {
    // The shared accessors answer only for the kinds that have the element.
    std::unique_ptr<OEOOBuyStock> stock(F()->NewOOBuyStock(1));
    EXPECT_EQ(stock->SetUnitType(OEUT_SHARES), 0);
    EXPECT_EQ(stock->SetSellType(OESELL_SELL), 0);
    EXPECT_EQ(stock->SetBuyType(OEString("buytocover")), 1);
    EXPECT_EQ(stock->GetBuyType(), OEBUY_BUYTOCOVER);

    // A word outside the keyword list is logged and leaves the element absent; an element of another
    // kind is logged and skipped.
    std::string text = AllKinds();
    text.replace(text.find("<SUBACCT>MARGIN"), 15, "<SUBACCT>BROKERAGE");
    text.replace(text.find("<OPTBUYTYPE>"), 12, "<SELLALL>Y<OPTBUYTYPE>");
    OEParseStatus status;
    std::unique_ptr<OEInvOOList> list = ParseList(text, 1, &status);
    EXPECT_EQ(status, OEPS_WARNINGS);
    ASSERT_EQ(LogCount(), 2);
    EXPECT_EQ(LogEntry(0)->GetCode(), OEPW_BADFORMAT);
    EXPECT_EQ(LogEntry(0)->GetTag(), OETAG_SUBACCT);
    EXPECT_EQ(LogEntry(1)->GetCode(), OEPW_INVALIDELEM);
    EXPECT_EQ(LogEntry(1)->GetTag(), OETAG_SELLALL);
    ASSERT_EQ(list->GetNumOpenOrder(), 11);
    EXPECT_EQ(list->GetOpenOrder(0)->GetOO()->ValidateTag(OETAG_SUBACCT), 0);
    EXPECT_EQ(list->GetOpenOrder(0)->GetOO()->AllRequiredPresent(), 0);
    EXPECT_EQ(list->GetOpenOrder(6)->AllRequiredPresent(), 1);
}

} // namespace
