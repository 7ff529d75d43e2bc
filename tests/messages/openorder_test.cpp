// Open orders: the INVOOLIST blocks of real statements read as written and round-trip in both forms;
// every kind of order, mixed, keeps its document order, its own elements and its required rules.
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

unsigned short Logged(OEParseWarning code, OETagID tag) {
    unsigned short n = 0;
    for (unsigned short i = 0; i < LogCount(); ++i)
        n += LogEntry(i)->GetCode() == code && LogEntry(i)->GetTag() == tag;
    return n;
}

// The kinds of a list, in order.
std::string Kinds(const OEInvOOList* list) {
    std::string kinds;
    for (unsigned short i = 0; i < list->GetNumOpenOrder(); ++i)
        kinds += std::string(
                     OETagDictionary::TheOETagDictionary()->GetTagString(list->GetOpenOrder(i)->GetType())) +
                 " ";
    return kinds;
}

// Parses, checks the tree is whole, then writes it in both forms and reads each back: the same text.
void ExpectRoundTrip(OEInvOOList* list, unsigned short version) {
    std::string canonical = BuildText(list);
    for (unsigned short endTags : {0, 1}) {
        OEParseStatus status;
        std::unique_ptr<OEInvOOList> again = ParseList(BuildText(list, endTags), version, &status);
        EXPECT_EQ(status, OEPS_OK) << "form " << endTags;
        EXPECT_EQ(BuildText(again.get()), canonical) << "form " << endTags;
    }
    std::unique_ptr<OEInvOOList> copy(F()->NewInvOOList(version));
    ASSERT_EQ(copy->DeepCopyFrom(list), 1);
    EXPECT_EQ(BuildText(copy.get()), canonical);
    EXPECT_EQ(Kinds(copy.get()), Kinds(list));
}

// Both corpus statements carry the same stock order (one in the standard's example, commented).
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
        std::unique_ptr<OEInvOOList> list =
            ParseList(text.substr(from, to + sizeof("</INVOOLIST>") - 1 - from), 2, &status);
        ASSERT_EQ(status, OEPS_OK);
        ASSERT_EQ(Kinds(list.get()), "OOBUYSTOCK ");
        OEOpenOrder* order = list->GetOpenOrder(0);
        EXPECT_EQ(order->AllRequiredPresent(), 1);
        EXPECT_EQ(order->GetBuyType(), OEBUY_BUY);
        EXPECT_EQ(order->ValidateTag(OETAG_BUYTYPE), 1);
        OEOO* oo = order->GetOO();
        ASSERT_NE(oo, nullptr);
        EXPECT_EQ(oo->AllRequiredPresent(), 1);
        EXPECT_STREQ(oo->GetFITId()->c_str(), "23321");
        EXPECT_STREQ(oo->GetSecID()->GetUniqueId()->c_str(), "666678578");
        EXPECT_STREQ(oo->GetSecID()->GetUniqueIdType()->c_str(), "CUSIP");
        OEString t;
        ASSERT_TRUE(oo->GetDatePlaced()->GetDateString(t));
        EXPECT_STREQ(t.c_str(), "20050624031505");
        OEAggregate::AmountText(*oo->GetUnits(), t);
        EXPECT_STREQ(t.c_str(), "100");
        OEAggregate::AmountText(*oo->GetLimitPrice(), t);
        EXPECT_STREQ(t.c_str(), "50.00");
        EXPECT_EQ(oo->GetSubAcct(), OESA_CASH);
        EXPECT_EQ(oo->GetDuration(), OEDUR_GOODTILCANCEL);
        EXPECT_EQ(oo->GetRestriction(), OERES_NONE);
        EXPECT_EQ(oo->GetStopPrice(), nullptr);
        EXPECT_EQ(oo->GetCurrency(), nullptr);
        ExpectRoundTrip(list.get(), 2);
    }
}

// One order of each kind (with the elements of its own), mixed so that no two kinds come in the
// order of the list's rows.
const char kOO[] = "<OO><FITID>%s<SECID><UNIQUEID>1234<UNIQUEIDTYPE>CUSIP</SECID><DTPLACED>20240102"
                   "<UNITS>10.5<SUBACCT>MARGIN<DURATION>DAY<RESTRICTION>MINUNITS<MINUNITS>5</OO>";
struct Kind {
    const char* tag;
    const char* extra;    // what follows the OO
    const char* required; // a required element of the kind, or null
};
const Kind kKinds[] = {
    {"OOSWITCHMF", "<SECID><UNIQUEID>987<UNIQUEIDTYPE>CUSIP</SECID><UNITTYPE>CURRENCY<SWITCHALL>Y",
     "SWITCHALL"},
    {"OOSELLSTOCK", "<SELLTYPE>SELLSHORT", "SELLTYPE"},
    {"OOBUYDEBT", "<AUCTION>Y<DTAUCTION>20240110", "AUCTION"},
    {"OOSELLOTHER", "<UNITTYPE>SHARES", "UNITTYPE"},
    {"OOBUYMF", "<BUYTYPE>BUYTOCOVER<UNITTYPE>SHARES", "BUYTYPE"},
    {"OOSELLDEBT", "", nullptr},
    {"OOBUYOPT", "<OPTBUYTYPE>BUYTOCLOSE", "OPTBUYTYPE"},
    {"OOSELLMF", "<SELLTYPE>SELL<UNITTYPE>CURRENCY<SELLALL>N", "SELLALL"},
    {"OOBUYOTHER", "<UNITTYPE>CURRENCY", "UNITTYPE"},
    {"OOSELLOPT", "<OPTSELLTYPE>SELLTOOPEN", "OPTSELLTYPE"},
    {"OOBUYSTOCK", "<BUYTYPE>BUY", "BUYTYPE"},
};

std::string Order(const Kind& k, const char* fitId, const std::string& extra) {
    char oo[sizeof(kOO) + 16];
    std::snprintf(oo, sizeof(oo), kOO, fitId);
    return std::string("<") + k.tag + ">" + oo + extra + "</" + k.tag + ">";
}

std::string AllKinds() {
    std::string text = "<INVOOLIST>";
    for (const Kind& k : kKinds) text += Order(k, k.tag, k.extra);
    return text + "</INVOOLIST>";
}

TEST(OpenOrder, EveryKindMixedKeepsItsOrderElementsAndRoundTrips) {
    OEParseStatus status;
    std::unique_ptr<OEInvOOList> list = ParseList(AllKinds(), 1, &status);
    ASSERT_EQ(status, OEPS_OK);
    std::string expected;
    for (const Kind& k : kKinds) expected += std::string(k.tag) + " ";
    ASSERT_EQ(Kinds(list.get()), expected);
    for (unsigned short i = 0; i < list->GetNumOpenOrder(); ++i) {
        OEOpenOrder* order = list->GetOpenOrder(i);
        EXPECT_EQ(order->AllRequiredPresent(), 1) << kKinds[i].tag;
        EXPECT_STREQ(order->GetOO()->GetFITId()->c_str(), kKinds[i].tag);
        EXPECT_EQ(order->GetOO()->AllRequiredPresent(), 1);
    }
    EXPECT_EQ(list->GetNumberOfChildren(), 11);

    auto* sw = dynamic_cast<OEOOSwitchMF*>(list->GetOpenOrder(0));
    ASSERT_NE(sw, nullptr);
    EXPECT_STREQ(sw->GetSecID()->GetUniqueId()->c_str(), "987");
    EXPECT_STREQ(sw->GetOO()->GetSecID()->GetUniqueId()->c_str(), "1234") << "the two SECIDs are apart";
    EXPECT_EQ(sw->GetUnitType(), OEUT_CURRENCY);
    EXPECT_TRUE(sw->GetSwitchAll());
    EXPECT_EQ(list->GetOpenOrder(1)->GetSellType(), OESELL_SELLSHORT);
    auto* debt = dynamic_cast<OEOOBuyDebt*>(list->GetOpenOrder(2));
    ASSERT_NE(debt, nullptr);
    EXPECT_TRUE(debt->GetAuction());
    EXPECT_NE(debt->GetDateAuction(), nullptr);
    EXPECT_EQ(list->GetOpenOrder(4)->GetBuyType(), OEBUY_BUYTOCOVER);
    EXPECT_EQ(static_cast<OEOOBuyOpt*>(list->GetOpenOrder(6))->GetOptBuyType(), OEOBT_BUYTOCLOSE);
    auto* sellMF = static_cast<OEOOSellMF*>(list->GetOpenOrder(7));
    EXPECT_FALSE(sellMF->GetSellAll());
    EXPECT_EQ(sellMF->ValidateTag(OETAG_SELLALL), 1);
    EXPECT_EQ(static_cast<OEOOSellOpt*>(list->GetOpenOrder(9))->GetOptSellType(), OEOST_SELLTOOPEN);
    EXPECT_EQ(list->GetOpenOrder(5)->GetNumberOfChildren(), 1) << "OOSELLDEBT holds only its OO";

    ExpectRoundTrip(list.get(), 1);
    // Written in field order, whatever the order read.
    std::string sample = BuildText(list->GetOpenOrder(7)); // the body of the order
    EXPECT_NE(sample.find("</OO>\n<SELLTYPE>SELL\n<UNITTYPE>CURRENCY\n<SELLALL>N\n"), std::string::npos)
        << sample;
}

// Dropping a required element (or the OO) leaves the order incomplete; DTAUCTION and the optional
// elements of OO are not required.
TEST(OpenOrder, RequiredElements) {
    for (const Kind& k : kKinds) {
        SCOPED_TRACE(k.tag);
        for (int drop = 0; drop < 2; ++drop) {
            std::string extra = k.extra;
            if (drop == 0) {
                if (!k.required) continue;
                size_t at = extra.find(std::string("<") + k.required + ">");
                size_t end = extra.find('<', at + 1);
                extra.erase(at, end == std::string::npos ? std::string::npos : end - at);
            }
            std::string text = Order(k, "1", extra);
            if (drop == 1) text.erase(text.find("<OO>"), text.find("</OO>") + 5 - text.find("<OO>"));
            OEParseStatus status;
            std::unique_ptr<OEInvOOList> list = ParseList("<INVOOLIST>" + text + "</INVOOLIST>", 2, &status);
            ASSERT_EQ(status, OEPS_OK);
            ASSERT_EQ(list->GetNumOpenOrder(), 1);
            EXPECT_EQ(list->GetOpenOrder(0)->AllRequiredPresent(), 0) << text;
        }
    }
    std::unique_ptr<OEOOBuyDebt> debt(F()->NewOOBuyDebt(1));
    debt->SetOO(F()->NewOO(1));
    EXPECT_EQ(debt->SetAuction(false), 1);
    EXPECT_EQ(debt->AllRequiredPresent(), 1) << "DTAUCTION is optional";

    // OO: each of its seven required rows matters.
    const OETagID required[] = {OETAG_FITID,   OETAG_SECID,    OETAG_DTPLACED,   OETAG_UNITS,
                                OETAG_SUBACCT, OETAG_DURATION, OETAG_RESTRICTION};
    for (OETagID missing : required) {
        std::unique_ptr<OEOO> oo(F()->NewOO(1));
        if (missing != OETAG_FITID) oo->SetFITId(OEString("1"));
        if (missing != OETAG_SECID) oo->SetSecID(F()->NewSecID(1));
        if (missing != OETAG_DTPLACED) oo->SetDatePlaced(OEString("20240101"));
        if (missing != OETAG_UNITS) oo->SetUnits(OEString("1"));
        if (missing != OETAG_SUBACCT) oo->SetSubAcct(OESA_CASH);
        if (missing != OETAG_DURATION) oo->SetDuration(OEDUR_DAY);
        if (missing != OETAG_RESTRICTION) oo->SetRestriction(OERES_ALLORNONE);
        EXPECT_EQ(oo->AllRequiredPresent(), 0) << missing;
        EXPECT_EQ(oo->ValidateTag(missing), 0);
    }
}

TEST(OpenOrder, VersionsKindsAndBadValues) {
    // SRVRTID and MEMO are version 1 only, SRVRTID2 and MEMO2 the others.
    struct V {
        unsigned short version, memo, memo2, srvr, srvr2;
    };
    for (const V& v : {V{1, 1, 0, 1, 0}, V{2, 0, 1, 0, 1}}) {
        std::unique_ptr<OEOO> oo(F()->NewOO(v.version));
        EXPECT_EQ(oo->SetMemo(OEString("m")), v.memo) << v.version;
        EXPECT_EQ(oo->SetMemo2(OEString("m")), v.memo2) << v.version;
        EXPECT_EQ(oo->SetServerTId(OEString("s")), v.srvr) << v.version;
        EXPECT_EQ(oo->SetServerTId2(OEString("s")), v.srvr2) << v.version;
    }

    // The shared accessors answer only for the kinds that have the element.
    std::unique_ptr<OEOOBuyStock> stock(F()->NewOOBuyStock(1));
    EXPECT_EQ(stock->SetUnitType(OEUT_SHARES), 0);
    EXPECT_EQ(stock->SetSellType(OESELL_SELL), 0);
    EXPECT_EQ(stock->SetBuyType(OEString("buytocover")), 1);
    EXPECT_EQ(stock->GetBuyType(), OEBUY_BUYTOCOVER);
    std::unique_ptr<OEOOSellDebt> sellDebt(F()->NewOOSellDebt(1));
    EXPECT_EQ(sellDebt->SetSellType(OESELL_SELL), 0);
    EXPECT_EQ(sellDebt->GetSellType(), OESELL_SELL) << "absent answers 0";
    EXPECT_EQ(sellDebt->ValidateTag(OETAG_SELLTYPE), 0);

    // A word outside the keyword list is logged and leaves the element absent; an element of
    // another kind is refused.
    std::string text = AllKinds();
    text.replace(text.find("<SUBACCT>MARGIN"), 15, "<SUBACCT>BROKERAGE");
    text.replace(text.find("<OPTBUYTYPE>BUYTOCLOSE"), 22, "<OPTBUYTYPE>BUYTOCLOSE<SELLALL>Y");
    OEParseStatus status;
    std::unique_ptr<OEInvOOList> list = ParseList(text, 1, &status);
    EXPECT_EQ(status, OEPS_WARNINGS);
    EXPECT_EQ(Logged(OEPW_INVALIDELEM, OETAG_SELLALL), 1) << "SELLALL in OOBUYOPT";
    ASSERT_EQ(list->GetNumOpenOrder(), 11);
    EXPECT_EQ(list->GetOpenOrder(6)->AllRequiredPresent(), 1);
    EXPECT_EQ(Logged(OEPW_BADFORMAT, OETAG_SUBACCT), 1);
    ASSERT_GE(list->GetNumOpenOrder(), 1);
    EXPECT_EQ(list->GetOpenOrder(0)->GetOO()->ValidateTag(OETAG_SUBACCT), 0);
    EXPECT_EQ(list->GetOpenOrder(0)->GetOO()->AllRequiredPresent(), 0);

    // Appending: null is refused; a list copied from another class is refused.
    std::unique_ptr<OEInvOOList> mine(F()->NewInvOOList(1));
    EXPECT_EQ(mine->AppendOpenOrder(nullptr), 0);
    EXPECT_EQ(mine->AppendOpenOrder(F()->NewOOSellDebt(1)), 1);
    EXPECT_EQ(mine->ValidateTag(OETAG_OOSELLDEBT), 1);
    std::unique_ptr<OESecList> secList(F()->NewSecList(1));
    EXPECT_EQ(mine->DeepCopyFrom(secList.get()), 0);
    mine->DeleteAllOpenOrder();
    EXPECT_EQ(mine->GetNumOpenOrder(), 0);
    EXPECT_EQ(mine->ValidateTag(OETAG_OOSELLDEBT), 0);
    EXPECT_EQ(BuildText(mine.get()), "");
}

// Failing the n-th allocation of a parse or a deep copy: a status, never a crash or a leak; a copy
// that reports success with no error recorded is whole.
TEST(OpenOrder, RunningOutOfMemoryInAParseOrACopyIsReported) {
    OEParseStatus status;
    std::unique_ptr<OEInvOOList> source = ParseList(AllKinds(), 1, &status);
    const std::string text = BuildText(source.get()); // the list's body, as the root is handed it
    bool parsedWhole = false;
    for (int allowed = 0; allowed < 400; allowed += 7) {
        std::unique_ptr<OEInvOOList> list(F()->NewInvOOList(1)), copy(F()->NewInvOOList(1));
        status = WithAllocations(allowed, [&] { return ParseInto(text, list.get()); });
        unsigned short copied = WithAllocations(allowed, [&] { return copy->DeepCopyFrom(source.get()); });
        EXPECT_TRUE(status == OEPS_NORESOURCE || status == OEPS_WARNINGS || status == OEPS_OK)
            << allowed << ": " << status;
        if (status == OEPS_OK) {
            parsedWhole = true;
            EXPECT_EQ(BuildText(list.get()), text) << allowed;
        }
        if (copied && OEThreadState::GetErrorCode() == OETE_NONE) {
            EXPECT_EQ(BuildText(copy.get()), BuildText(source.get())) << allowed;
        }
    }
    EXPECT_TRUE(parsedWhole) << "the range reaches a parse with enough memory";
    OEThreadState::SetErrorCode(OETE_NONE);
}

} // namespace
