// The aggregate machinery itself, through real classes: element kinds and their failures, child
// slots shared by several tags, duplicates, copies, the child walk, a host factory, and running
// out of memory in the middle of a parse or a build.
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <string>

using namespace msgtest;

namespace {

const char kOneStatement[] =
    "OFXHEADER:100\nDATA:OFXSGML\nVERSION:102\n\n<OFX><SIGNONMSGSRSV1><SONRS><STATUS><CODE>0<SEVERITY>INFO</"
    "STATUS>"
    "<DTSERVER>20240105<LANGUAGE>ENG</SONRS></"
    "SIGNONMSGSRSV1><CREDITCARDMSGSRSV1><CCSTMTTRNRS><TRNUID>7<STATUS>"
    "<CODE>0<SEVERITY>INFO</STATUS><CCSTMTRS><CURDEF>EUR<CCACCTFROM><ACCTID>4111</CCACCTFROM><BANKTRANLIST>"
    "<DTSTART>20240101<DTEND>20240131<STMTTRN><TRNTYPE>PAYMENT<DTPOSTED>20240110<TRNAMT>50<FITID>P1"
    "<PAYEE><NAME>Shop<ADDR1>1 Road<CITY>Town<STATE>ST<POSTALCODE>123<PHONE>555</PAYEE>"
    "<ORIGCURRENCY><CURRATE>1.0850<CURSYM>USD</ORIGCURRENCY></STMTTRN>"
    "<STMTTRN><TRNTYPE>FEE<DTPOSTED>20240111<TRNAMT>-2.5<FITID>P2<CCACCTTO><ACCTID>9</CCACCTTO></STMTTRN>"
    "</BANKTRANLIST><LEDGERBAL><BALAMT>-47.5<DTASOF>20240131</LEDGERBAL></CCSTMTRS></CCSTMTTRNRS>"
    "</CREDITCARDMSGSRSV1></OFX>";

unsigned short Logged(OEParseWarning code, OETagID tag) {
    unsigned short n = 0;
    for (unsigned short i = 0; i < LogCount(); ++i)
        n += LogEntry(i)->GetCode() == code && LogEntry(i)->GetTag() == tag;
    return n;
}

TEST(Machinery, ElementKindsConvertOrLogAndStayUnset) {
    struct Row {
        OETagID tag;
        const char* text;
        unsigned short marked;
        OEParseWarning logged; // OEPW_UNKNOWNEXCEPTION: nothing expected
    };
    const Row rows[] = {
        {OETAG_TRNTYPE, "Pos", 1, OEPW_UNKNOWNEXCEPTION}, // keywords ignore case
        {OETAG_TRNTYPE, "SHOPPING", 0, OEPW_BADFORMAT},
        {OETAG_TRNAMT, "12.3x", 0, OEPW_BADFORMAT},
        {OETAG_DTPOSTED, "2024-01-05", 0, OEPW_BADFORMAT},
        {OETAG_CORRECTACTION, "delete", 1, OEPW_UNKNOWNEXCEPTION},
        {OETAG_CHECKNUM, "1234567890123", 1, OEPW_TOOLONG}, // kept whole, and logged
        {OETAG_NAME, "n", 1, OEPW_UNKNOWNEXCEPTION},
    };
    for (const Row& r : rows) {
        OEParseLogger::TheOEParseLogger()->DeleteAll();
        std::unique_ptr<OEBankStatementTx> tx(F()->NewBankStatementTx(1));
        OETagDictionaryEntry entry{r.tag, ""};
        EXPECT_EQ(tx->HandleTagElement(&entry, OEString(r.text)), OEPS_OK) << r.text;
        EXPECT_EQ(tx->ValidateTag(r.tag), r.marked) << r.text;
        if (r.logged != OEPW_UNKNOWNEXCEPTION) {
            EXPECT_EQ(Logged(r.logged, r.tag), 1) << r.text;
        }
    }
    std::unique_ptr<OEBankStatementTx> tx(F()->NewBankStatementTx(1));
    OETagDictionaryEntry unknown{OETAG_BALAMT, "BALAMT"};
    EXPECT_EQ(tx->HandleTagElement(&unknown, OEString("1")), OEPS_INVALID);
    tx->SetCheckNum(OEString("1234567890123")); // the setter keeps a long value whole too
    EXPECT_STREQ(tx->GetCheckNum()->c_str(), "1234567890123");

    std::unique_ptr<OEIncTransaction> inc(F()->NewIncTransaction(1));
    EXPECT_EQ(inc->SetInclude(OEString("yes")), 0) << "Y or N only";
    std::unique_ptr<OESignOnRq> s(F()->NewSignOnRq(1));
    EXPECT_EQ(s->SetAppVer(OEString("70000")), 0) << "beyond 16 bits";
    EXPECT_EQ(s->SetAppVer(OEString("-1")), 0);
}

TEST(Machinery, SharedSlotsDuplicatesAndTheChildWalk) {
    std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
    ASSERT_EQ(ParseInto(kOneStatement, file.get()), OEPS_OK);
    OEMessageSetRs* set = file->GetResponse(0)->GetMessageSet(1);
    ASSERT_NE(set, nullptr);
    OECCStatementRs* stmt = dynamic_cast<OECCStatementRs*>(set->GetTrans(0)->GetActualTrans());
    ASSERT_NE(stmt, nullptr);
    OEBankStatementTx* first = stmt->GetTransactionList()->GetStatementTx(0);
    OEBankStatementTx* second = stmt->GetTransactionList()->GetStatementTx(1);
    ASSERT_NE(first->GetPayee(), nullptr);
    EXPECT_STREQ(first->GetPayee()->GetCity()->c_str(), "Town");
    ASSERT_NE(first->GetCurrency(), nullptr);
    EXPECT_EQ(first->GetCurrency()->GetType(), OETAG_ORIGCURRENCY);
    EXPECT_EQ(first->ValidateTag(OETAG_CURRENCY), 0);
    EXPECT_EQ(second->GetAccountTo()->GetType(), OETAG_CCACCTTO);
    EXPECT_EQ(stmt->GetNumberOfChildren(), 3); // account, transaction list, ledger balance
    EXPECT_EQ(stmt->GetChild(0), stmt->GetAccountFrom());
    EXPECT_EQ(stmt->GetChild(2), stmt->GetLedgerBalance());

    // PAYEE2 shares the payee's slot but is a version-2 tag: on a version-1 transaction it is
    // refused and nothing changes; a null payee empties the slot.
    std::unique_ptr<OEPayee2> refused(F()->NewPayee2(2));
    EXPECT_EQ(first->SetPayee2(refused.get()), 0);
    EXPECT_NE(first->GetPayee(), nullptr);
    first->SetPayee(nullptr);
    EXPECT_EQ(first->GetPayee(), nullptr);
    EXPECT_EQ(first->ValidateTag(OETAG_PAYEE), 0);
    first->SetName(OEString("n"));
    EXPECT_EQ(first->AllRequiredPresent(), 1);

    // A second LEDGERBAL replaces the first and is logged.
    std::string twice(kOneStatement);
    twice.insert(twice.find("</CCSTMTRS>"), "<LEDGERBAL><BALAMT>1<DTASOF>20240131</LEDGERBAL>");
    std::unique_ptr<OEFileRs> again(F()->NewFileRs(0));
    EXPECT_EQ(ParseInto(twice, again.get()), OEPS_WARNINGS);
    EXPECT_EQ(Logged(OEPW_EXTRAAGG, OETAG_LEDGERBAL), 1);
    OECCStatementRs* s2 = dynamic_cast<OECCStatementRs*>(
        again->GetResponse(0)->GetMessageSet(1)->GetTrans(0)->GetActualTrans());
    OEString amount;
    OEAggregate::AmountText(*s2->GetLedgerBalance()->GetBalanceAmount(), amount);
    EXPECT_STREQ(amount.c_str(), "1");
}

TEST(Machinery, DeepCopiesAreEqualAndIndependent) {
    std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
    ASSERT_EQ(ParseInto(kOneStatement, file.get()), OEPS_OK);
    std::unique_ptr<OEFileRs> copy(F()->NewFileRs(0));
    ASSERT_EQ(copy->DeepCopyFrom(file.get()), 1);
    std::string text = BuildText(file.get());
    EXPECT_EQ(BuildText(copy.get()), text);
    file.reset(); // the copy owns nothing of the original
    EXPECT_EQ(BuildText(copy.get()), text);

    std::unique_ptr<OEStatus> status(F()->NewStatus(1));
    std::unique_ptr<OEBankStatementTx> other(F()->NewBankStatementTx(1));
    EXPECT_EQ(other->DeepCopyFrom(status.get()), 0) << "another class is refused";
}

// Both sides: a copied file keeps its sign-on, the synchronisation's wrappers and the set's tag
// that each wrapper carries, and writes the same text.
TEST(Machinery, DeepCopiesOfSetsSyncsAndWrappersOnBothSides) {
    const char kHead[] = "OFXHEADER:100\nDATA:OFXSGML\nVERSION:102\n\n";
    const std::string request =
        std::string(kHead) +
        "<OFX><SIGNONMSGSRQV1><SONRQ><DTCLIENT>20240105<USERID>u<USERPASS>p<LANGUAGE>ENG<FI><ORG>O</FI>"
        "<APPID>A<APPVER>0100</SONRQ></SIGNONMSGSRQV1><BANKMSGSRQV1><STMTTRNRQ><TRNUID>1<STMTRQ>"
        "<BANKACCTFROM><BANKID>1<ACCTID>2<ACCTTYPE>SAVINGS</BANKACCTFROM></STMTRQ></STMTTRNRQ>"
        "<INTRASYNCRQ><TOKEN>0<REJECTIFMISSING>N<BANKACCTFROM><BANKID>1<ACCTID>2<ACCTTYPE>SAVINGS"
        "</BANKACCTFROM><INTRATRNRQ><TRNUID>2</INTRATRNRQ></INTRASYNCRQ></BANKMSGSRQV1></OFX>";
    const std::string response =
        std::string(kHead) +
        "<OFX><BANKMSGSRSV1><INTRASYNCRS><TOKEN>5<BANKACCTFROM><BANKID>1<ACCTID>2<ACCTTYPE>SAVINGS"
        "</BANKACCTFROM><INTRATRNRS><TRNUID>2<STATUS><CODE>0<SEVERITY>INFO</STATUS></INTRATRNRS>"
        "</INTRASYNCRS></BANKMSGSRSV1></OFX>";

    std::unique_ptr<OEFileRq> rq(F()->NewFileRq(0)), rqCopy(F()->NewFileRq(0));
    ParseInto(request, rq.get());
    ASSERT_EQ(rq->GetNumberOfRequest(), 1);
    ASSERT_EQ(rqCopy->DeepCopyFrom(rq.get()), 1);
    EXPECT_EQ(BuildText(rqCopy.get()), BuildText(rq.get()));
    OEMessageSetRq* bankRq = rqCopy->GetRequest(0)->GetMessageSet(1);
    ASSERT_NE(bankRq, nullptr);
    EXPECT_NE(rqCopy->GetRequest(0)->GetMessageSet(0)->GetSignOnRq(), nullptr);
    ASSERT_EQ(bankRq->GetNumSync(), 1);
    ASSERT_EQ(bankRq->GetSync(0)->GetNumTrans(), 1);
    EXPECT_EQ(bankRq->GetSync(0)->GetMsgsRqTag(), OETAG_BANKMSGSRQV1);
    EXPECT_EQ(bankRq->GetSync(0)->GetTrans(0)->GetMsgsRqTag(), OETAG_BANKMSGSRQV1);
    EXPECT_EQ(bankRq->GetTrans(0)->GetMsgsRqTag(), OETAG_BANKMSGSRQV1);

    std::unique_ptr<OEFileRs> rs(F()->NewFileRs(0)), rsCopy(F()->NewFileRs(0));
    ParseInto(response, rs.get());
    ASSERT_EQ(rsCopy->DeepCopyFrom(rs.get()), 1);
    EXPECT_EQ(BuildText(rsCopy.get()), BuildText(rs.get()));
    OESyncRs* sync = rsCopy->GetResponse(0)->GetMessageSet(0)->GetSync(0);
    ASSERT_NE(sync, nullptr);
    ASSERT_EQ(sync->GetNumTrans(), 1);
    EXPECT_EQ(sync->GetMsgsRsTag(), OETAG_BANKMSGSRSV1);
    EXPECT_EQ(sync->GetTrans(0)->GetMsgsRsTag(), OETAG_BANKMSGSRSV1);
    EXPECT_STREQ(sync->GetTrans(0)->GetTransUserID()->c_str(), "2");

    // A file of the other side copies its headers but no bodies.
    std::unique_ptr<OEFileRq> mixed(F()->NewFileRq(0));
    ASSERT_EQ(mixed->DeepCopyFrom(rs.get()), 1);
    EXPECT_EQ(mixed->GetNumberOfRequest(), 0);
}

// A host factory: every parsed transaction comes out as the host's own class.
class HostTx : public OEBankStatementTx {
public:
    explicit HostTx(unsigned short v = 0) : OEBankStatementTx(v) {}
};
class HostFactory : public OEDataObjFactory {
public:
    OEBankStatementTx* NewBankStatementTx(unsigned short version) override { return Create<HostTx>(version); }
};

TEST(Machinery, HostFactoryDecidesTheClassesOfAParsedTree) {
    HostFactory host;
    // The library keeps the factory it made (its flag is cleared by every construction), so the
    // test hands it back afterwards rather than losing it.
    OEDataObjFactory* previous = OEDataObj::GetFactory();
    OEDataObj::SetFactory(&host);
    std::unique_ptr<OEFileRs> file(host.NewFileRs(0));
    OEParseStatus status = ParseInto(kOneStatement, file.get());
    OEBankStatementTx* tx = nullptr;
    if (status == OEPS_OK) {
        auto* stmt = dynamic_cast<OECCStatementRs*>(
            file->GetResponse(0)->GetMessageSet(1)->GetTrans(0)->GetActualTrans());
        tx = stmt ? stmt->GetTransactionList()->GetStatementTx(0) : nullptr;
    }
    EXPECT_NE(dynamic_cast<HostTx*>(tx), nullptr);
    file.reset();
    OEDataObj::SetFactory(previous);
}

// A tag that owns a different presence bit per version: MEMO is row 0 at version 1 and row 2 from
// version 2 on, NAME (row 1) applies everywhere, and SIC (row 3) only at version 1. The index of
// the descriptor must give the same bits as the row-by-row search of the valid table.
const OETagRow kVersionedValid[] = {{OETAG_MEMO, OEVM_V1, 0},
                                    {OETAG_NAME, OEVM_ALL, 0},
                                    {OETAG_MEMO, OEVM_NOTV1, 0},
                                    {OETAG_SIC, OEVM_V1, 0}};
class Versioned : public OEAggregate {
public:
    explicit Versioned(unsigned short version) : OEAggregate(version) { SetType(OETAG_STMTTRN); }
    const OEAggregateDesc& Describe() const override;
    unsigned short Set(OETagID tag, const char* text) { return SetFromText(tag, OEString(text)); }
    const OEString* Get(OETagID tag) const { return GetText(tag); }
    OEString m_memo, m_name, m_sic;
};
const OEFieldRow kVersionedFields[] = {
    {OETAG_NAME, OEFK_TEXT, OE_MEMBER(Versioned, m_name), nullptr, nullptr},
    {OETAG_MEMO, OEFK_TEXT, OE_MEMBER(Versioned, m_memo), nullptr, nullptr},
    {OETAG_SIC, OEFK_TEXT, OE_MEMBER(Versioned, m_sic), nullptr, nullptr},
};
const OEAggregateDesc kVersionedDesc =
    OE_DESC(OETAG_STMTTRN, kVersionedValid, kVersionedValid, kVersionedFields);
const OEAggregateDesc& Versioned::Describe() const {
    return kVersionedDesc;
}

TEST(Machinery, ATagRepeatedInTheValidTableOwnsTheBitOfItsVersion) {
    struct Case {
        unsigned short version;
        std::uint32_t memoBit; // the present word after setting MEMO alone
        unsigned short sicValid;
        const char* built;
    };
    // Version word 3 matches both masks: the first row that applies wins.
    const Case cases[] = {{1, 1u << 0, 1, "<NAME>n\n<MEMO>m\n<SIC>s\n"},
                          {2, 1u << 2, 0, "<NAME>n\n<MEMO>m\n"},
                          {3, 1u << 0, 1, "<NAME>n\n<MEMO>m\n<SIC>s\n"}};
    for (const Case& c : cases) {
        Versioned v(c.version);
        EXPECT_EQ(v.Get(OETAG_MEMO), nullptr);
        ASSERT_EQ(v.Set(OETAG_MEMO, "m"), 1) << c.version;
        EXPECT_EQ(v.GetPresentWord(0), c.memoBit) << c.version;
        EXPECT_EQ(v.ValidateTag(OETAG_MEMO), 1);
        ASSERT_NE(v.Get(OETAG_MEMO), nullptr);
        EXPECT_STREQ(v.Get(OETAG_MEMO)->c_str(), "m");
        EXPECT_EQ(v.IsValidTag(OETAG_SIC), c.sicValid) << c.version;
        EXPECT_EQ(v.Set(OETAG_SIC, "s"), c.sicValid) << c.version;
        EXPECT_EQ(v.IsValidTag(OETAG_CHECKNUM), 0);
        OETagDictionaryEntry name{OETAG_NAME, "NAME"};
        EXPECT_EQ(v.HandleTagElement(&name, OEString("n")), OEPS_OK);
        EXPECT_EQ(BuildText(&v), c.built) << c.version;
        // Clearing goes through the generic search and must find the same bit.
        EXPECT_EQ(v.ClearTag(OETAG_MEMO), 1);
        EXPECT_EQ(v.Get(OETAG_MEMO), nullptr) << c.version;
        EXPECT_EQ(BuildText(&v).find("<MEMO>"), std::string::npos) << c.version;
    }
}

int g_remaining = 0;
int FailAfter(std::size_t) {
    return g_remaining-- > 0 ? 0 : 1;
}

TEST(Machinery, RunningOutOfMemoryIsReportedNotFatal) {
    std::string text(kOneStatement);
    // Fail the n-th allocation for a range of n: every parse ends with a status, never a crash.
    for (int allowed = 0; allowed < 400; allowed += 7) {
        std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
        OEParseStatus status;
        {
            g_remaining = allowed;
            OEMemory::FailureHook previous = OEMemory::SetFailureHook(&FailAfter);
            status = ParseInto(text, file.get());
            OEMemory::SetFailureHook(previous);
        }
        EXPECT_TRUE(status == OEPS_OK || status == OEPS_NORESOURCE || status == OEPS_WARNINGS ||
                    status == OEPS_INVALID)
            << allowed << ": " << status;
        OEThreadState::SetErrorCode(OETE_NONE);
    }
    // Out of memory during a build turns into status 1.
    std::unique_ptr<OEFileRs> file(F()->NewFileRs(0));
    ASSERT_EQ(ParseInto(text, file.get()), OEPS_OK);
    struct Never {
        static int Fail(std::size_t) { return 1; }
    };
    OEBuffer out(16, 16);
    OEBuilder builder;
    OEMemory::FailureHook previous = OEMemory::SetFailureHook(&Never::Fail);
    int status = builder.Build(&out, file.get(), OEBSO_STRICT, 0, 0);
    OEMemory::SetFailureHook(previous);
    EXPECT_EQ(status, OEBS_OUTOFMEMORY);
    EXPECT_EQ(builder.GetFailedObject(), file.get());
    OEThreadState::SetErrorCode(OETE_NONE);
}

} // namespace
