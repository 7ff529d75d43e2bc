// The message envelope: roots, message sets, sign-on, transaction wrappers, status, warning and
// synchronisation, with the rules kept as they are.
#include "msg_helpers.h"

#include <gtest/gtest.h>

#include <memory>

using namespace msgtest;

namespace {

OEMessageSetRq* Set(OETagID tag) {
    OEMessageSetRq* set = F()->NewMessageSetRq(1);
    set->SetType(tag);
    return set;
}

OESignOnRq* CompleteSignOn() {
    OESignOnRq* s = F()->NewSignOnRq(1);
    s->SetDtClient(OEString("20240105"));
    s->SetLanguage(OEString("ENG"));
    s->SetAppId(OEString("QWIN"));
    s->SetAppVer(static_cast<unsigned short>(2700));
    return s;
}

TEST(Envelope, RootWritesSignOnFirstAndRefusesDuplicateSets) {
    std::unique_ptr<OERequest> rq(F()->NewRequest(1));
    OEMessageSetRq* bank = Set(OETAG_BANKMSGSRQV1);
    OETransRq* trn = F()->NewTransRq(1);
    trn->SetType(OETAG_STMTTRNRQ);
    trn->SetTransUserID(OEString("1"));
    bank->AppendTrans(trn);
    rq->AppendMessageSet(bank); // appended before the sign-on set
    OEMessageSetRq* signOn = Set(OETAG_SIGNONMSGSRQV1);
    rq->AppendMessageSet(signOn);
    EXPECT_EQ(rq->AllRequiredPresent(), 1);
    EXPECT_EQ(BuildText(rq.get()),
              "<SIGNONMSGSRQV1>\n</SIGNONMSGSRQV1>\n<BANKMSGSRQV1>\n<STMTTRNRQ>\n<TRNUID>1\n</STMTTRNRQ>\n"
              "</BANKMSGSRQV1>\n");

    rq->AppendMessageSet(Set(OETAG_BANKMSGSRQV1));
    int status = 0;
    BuildText(rq.get(), 0, &status);
    EXPECT_EQ(status, OEBS_DUPLICATECHILD);

    std::unique_ptr<OERequest> noSignOn(F()->NewRequest(1));
    noSignOn->AppendMessageSet(Set(OETAG_BANKMSGSRQV1));
    EXPECT_EQ(noSignOn->AllRequiredPresent(), 0);
}

TEST(Envelope, SecurityListSetIsWrittenAfterEmail) {
    std::unique_ptr<OERequest> rq(F()->NewRequest(1));
    rq->AppendMessageSet(Set(OETAG_SECLISTMSGSRQV1));
    rq->AppendMessageSet(Set(OETAG_EMAILMSGSRQV1));
    rq->AppendMessageSet(Set(OETAG_PROFMSGSRQV1));
    std::string text = BuildText(rq.get());
    EXPECT_LT(text.find("<EMAILMSGSRQV1>"), text.find("<SECLISTMSGSRQV1>"));
    EXPECT_LT(text.find("<SECLISTMSGSRQV1>"), text.find("<PROFMSGSRQV1>"));
}

TEST(Envelope, NullSignOnLeavesTheMarkSetAndWritesNothing) {
    std::unique_ptr<OEMessageSetRq> set(Set(OETAG_SIGNONMSGSRQV1));
    EXPECT_EQ(set->AllRequiredPresent(), 0);
    set->SetSignOnRq(CompleteSignOn());
    EXPECT_EQ(set->ValidateTag(OETAG_SONRQ), 1);
    set->SetSignOnRq(nullptr);
    EXPECT_EQ(set->ValidateTag(OETAG_SONRQ), 1) << "the mark survives a null sign-on";
    EXPECT_EQ(set->AllRequiredPresent(), 1);
    EXPECT_EQ(BuildText(set.get()), "");
    EXPECT_EQ(set->DisconnectSignOnRq(), 0);

    OESignOnRq* mine = CompleteSignOn();
    set->SetSignOnRq(mine);
    EXPECT_EQ(set->DisconnectSignOnRq(), 1);
    EXPECT_EQ(set->GetSignOnRq(), nullptr);
    EXPECT_EQ(set->ValidateTag(OETAG_SONRQ), 0);
    delete mine; // handed back to us
}

TEST(Envelope, DeepCopyClearsTheResponseMarkNotSonrq) {
    std::unique_ptr<OEMessageSetRq> target(Set(OETAG_SIGNONMSGSRQV1));
    target->SetSignOnRq(CompleteSignOn());
    std::unique_ptr<OEMessageSetRq> source(Set(OETAG_SIGNONMSGSRQV1));
    ASSERT_EQ(target->DeepCopyFrom(source.get()), 1);
    EXPECT_EQ(target->GetSignOnRq(), nullptr);
    // The copy of the base members brings the source's (empty) marks; before that the slip
    // tried to clear SONRS, which is not a tag of a request set: it is logged as unknown.
    bool loggedUnknown = false;
    for (unsigned short i = 0; i < LogCount(); ++i)
        if (LogEntry(i)->GetCode() == OEPW_UNKNOWNTAG && LogEntry(i)->GetTag() == OETAG_SONRS)
            loggedUnknown = true;
    EXPECT_TRUE(loggedUnknown);

    OETransRq* trn = F()->NewTransRq(1);
    trn->SetType(OETAG_STMTTRNRQ);
    trn->SetTransUserID(OEString("9"));
    source->AppendTrans(trn);
    source->SetSignOnRq(CompleteSignOn());
    ASSERT_EQ(target->DeepCopyFrom(source.get()), 1);
    ASSERT_EQ(target->GetNumTrans(), 1);
    EXPECT_EQ(BuildText(target.get()), BuildText(source.get()));
}

TEST(Envelope, InnerRequestMaps) {
    struct Row {
        OETagID inner, msgSet, wrapper, sync;
    };
    const Row rows[] = {
        {OETAG_STMTRQ, OETAG_BANKMSGSET, OETAG_STMTTRNRQ, OETAG_NONE},
        {OETAG_MAILRQ, OETAG_NONE, OETAG_MAILTRNRQ, OETAG_NONE}, // the e-mail row keys on the wrapper
        {OETAG_MAILTRNRQ, OETAG_EMAILMSGSET, OETAG_NONE, OETAG_NONE},
        {OETAG_INTRACANRQ, OETAG_BANKMSGSET, OETAG_INTRATRNRQ, OETAG_INTRASYNCRQ},
        {OETAG_CCSTMTRQ, OETAG_CREDITCARDMSGSET, OETAG_CCSTMTTRNRQ, OETAG_NONE},
        {OETAG_K_PAYROLLTRNRQ, OETAG_NONE, OETAG_NONE, OETAG_K_PAYROLLUPDATERQ},
        {OETAG_K_PAYROLLUPDATERQ, OETAG_K_PAYROLLMSGSET, OETAG_NONE, OETAG_NONE},
        {OETAG_PINCHRQ, OETAG_SIGNONMSGSET, OETAG_PINCHTRNRQ, OETAG_NONE},
    };
    for (const Row& r : rows) {
        EXPECT_EQ(OEMessageSetRq::MsgIDToMsgSetID(r.inner), r.msgSet) << r.inner;
        EXPECT_EQ(OETransRq::MsgIDToTranWrapper(r.inner), r.wrapper) << r.inner;
        EXPECT_EQ(OESyncRq::MsgIDToSyncWrapper(r.inner), r.sync) << r.inner;
    }
}

TEST(Envelope, ParsedChildrenAreRoutedAndDuplicatesHandled) {
    const char* text = "<OFX><SIGNONMSGSRSV1><SONRS><STATUS><CODE>0<SEVERITY>INFO</"
                       "STATUS><DTSERVER>20240105<LANGUAGE>ENG</SONRS>"
                       "<SONRS><STATUS><CODE>0<SEVERITY>INFO</STATUS><DTSERVER>20240106<LANGUAGE>ENG</"
                       "SONRS></SIGNONMSGSRSV1>"
                       "<BANKMSGSRSV1><STMTTRNRS><TRNUID>1<STATUS><CODE>1<SEVERITY>INFO</STATUS></STMTTRNRS>"
                       "<INTRASYNCRS><TOKEN>5<BANKACCTFROM><BANKID>1<ACCTID>2<ACCTTYPE>SAVINGS</BANKACCTFROM>"
                       "<INTRATRNRS><TRNUID>2<STATUS><CODE>0<SEVERITY>INFO</STATUS></INTRATRNRS></"
                       "INTRASYNCRS></BANKMSGSRSV1>"
                       "<BANKMSGSRSV1><STMTTRNRS><TRNUID>3</STMTTRNRS></BANKMSGSRSV1></OFX>";
    std::unique_ptr<OEFileRs> file(F()->NewFileRs(1));
    OEParseStatus status = ParseInto(text, file.get());
    EXPECT_EQ(status, OEPS_INVALID) << "a second BANKMSGSRSV1 is refused";
    ASSERT_EQ(file->GetNumberOfResponse(), 1);
    OEResponse* rs = file->GetResponse(0);
    ASSERT_EQ(rs->GetNumMessageSet(), 2);
    OEMessageSetRs* signOn = rs->GetMessageSet(0);
    ASSERT_NE(signOn->GetSignOnRs(), nullptr);
    OEString when;
    signOn->GetSignOnRs()->GetDtServer()->GetDateString(when);
    EXPECT_STREQ(when.c_str(), "20240106") << "the second SONRS replaces the first";
    OEMessageSetRs* bank = rs->GetMessageSet(1);
    EXPECT_EQ(bank->GetNumTrans(), 1);
    ASSERT_EQ(bank->GetNumSync(), 1);
    OESyncRs* sync = bank->GetSync(0);
    EXPECT_EQ(sync->GetNumTrans(), 1);
    EXPECT_EQ(sync->AllRequiredPresent(), 1);
    // Code 1 (up to date) satisfies the wrapper without an STMTRS.
    EXPECT_EQ(bank->GetTrans(0)->IsUpToDate(), 1);
    EXPECT_EQ(bank->GetTrans(0)->AllRequiredPresent(), 1);
    int extra = 0;
    for (unsigned short i = 0; i < LogCount(); ++i) extra += LogEntry(i)->GetCode() == OEPW_EXTRAAGG;
    EXPECT_EQ(extra, 2);
}

// A body may mix versions: each set takes its version from its own tag, whatever the file's.
TEST(Envelope, VersionOneAndTwoSetsShareABody) {
    const char* text = "<OFX><SIGNONMSGSRSV1><SONRS><STATUS><CODE>0<SEVERITY>INFO</STATUS>"
                       "<DTSERVER>20240105<LANGUAGE>ENG</SONRS></SIGNONMSGSRSV1>"
                       "<BANKMSGSRSV2><STMTTRNRS><TRNUID>1<STATUS><CODE>1<SEVERITY>INFO</STATUS>"
                       "</STMTTRNRS></BANKMSGSRSV2></OFX>";
    for (unsigned short version : {1, 2}) {
        SCOPED_TRACE(version);
        std::unique_ptr<OEFileRs> file(F()->NewFileRs(version));
        ASSERT_EQ(ParseInto(text, file.get()), OEPS_OK);
        OEResponse* rs = file->GetResponse(0);
        ASSERT_EQ(rs->GetNumMessageSet(), 2);
        EXPECT_EQ(rs->GetMessageSet(0)->GetMsgSetVersion(), 1);
        EXPECT_EQ(rs->GetMessageSet(1)->GetMsgSetVersion(), 2);
        EXPECT_EQ(rs->GetMessageSet(1)->GetNumTrans(), 1);
        EXPECT_EQ(rs->AllRequiredPresent(), 1);
        EXPECT_NE(BuildText(rs).find("<BANKMSGSRSV2>\n<STMTTRNRS>"), std::string::npos);
    }
}

TEST(Status, CodeRangeAndSeverityWords) {
    struct Row {
        const char* text;
        unsigned short accepted;
        OEParseWarning logged;
    };
    const Row codes[] = {{"-99999", 1, OEPW_UNKNOWNEXCEPTION},
                         {"999999", 1, OEPW_UNKNOWNEXCEPTION},
                         {"-100000", 0, OEPW_TOOLONG},
                         {"1000000", 0, OEPW_TOOLONG},
                         {"12a", 0, OEPW_BADFORMAT}};
    for (const Row& r : codes) {
        OEParseLogger::TheOEParseLogger()->DeleteAll();
        std::unique_ptr<OEStatus> s(F()->NewStatus(1));
        EXPECT_EQ(s->SetCode(OEString(r.text)), r.accepted) << r.text;
        EXPECT_EQ(s->ValidateTag(OETAG_CODE), r.accepted) << r.text;
        if (!r.accepted) {
            ASSERT_EQ(LogCount(), 1) << r.text;
            EXPECT_EQ(LogEntry(0)->GetCode(), r.logged) << r.text;
            EXPECT_EQ(LogEntry(0)->GetTag(), OETAG_CODE);
        }
    }
    OEParseLogger::TheOEParseLogger()->DeleteAll();
    std::unique_ptr<OEStatus> s(F()->NewStatus(1));
    EXPECT_EQ(s->SetSeverity(OEString("error")), 1);
    EXPECT_EQ(s->GetSeverity(), OESEV_ERROR);
    EXPECT_EQ(s->SetSeverity(OEString("FATAL")), 0);
    ASSERT_EQ(LogCount(), 2) << "a bad severity is reported twice";
    EXPECT_EQ(LogEntry(0)->GetTag(), OETAG_NONE);
    EXPECT_EQ(LogEntry(1)->GetTag(), OETAG_SEVERITY);

    std::unique_ptr<OEStatus> unset(F()->NewStatus(2));
    unset->SetCode(0L);
    unset->SetSeverity(static_cast<OEStatusSeverity>(OESEV_NOTSET));
    int status = 0;
    BuildText(unset.get(), 0, &status);
    EXPECT_EQ(status, OEBS_NOTEXTFORM) << "a severity without text fails the build";
    EXPECT_EQ(unset->SetMessageText(OEString("v1 only")), 0);
    EXPECT_EQ(unset->SetMessage2Text(OEString("v2")), 1);
}

TEST(TransactionWrappers, RequiredInnerRulesIncludingTheKeptExclusiveOr) {
    struct Row {
        OETagID wrapper;
        std::vector<OETagID> marks;
        unsigned short expected;
    };
    const Row rows[] = {
        {OETAG_INTRATRNRQ, {OETAG_INTRARQ}, 1},
        {OETAG_INTRATRNRQ, {OETAG_INTRARQ, OETAG_INTRAMODRQ}, 0},
        {OETAG_INTRATRNRQ, {OETAG_INTRARQ, OETAG_INTRAMODRQ, OETAG_INTRACANRQ}, 1}, // kept as it is
        {OETAG_WIRETRNRQ, {OETAG_WIRERQ, OETAG_WIRECANRQ}, 0},
        {OETAG_STMTTRNRQ, {OETAG_STMTRQ}, 1},
        {OETAG_STMTTRNRQ, {OETAG_CCSTMTRQ}, 0},
        {OETAG_PROFTRNRQ, {}, 1}, // no rule for this wrapper
    };
    for (const Row& r : rows) {
        std::unique_ptr<OETransRq> trn(F()->NewTransRq(1));
        trn->SetType(r.wrapper);
        trn->SetTransUserID(OEString("1"));
        trn->SetActualTrans(F()->NewBankStatementRq(1)); // some inner object must exist
        trn->ClearTag(OETAG_STMTRQ);
        for (OETagID t : r.marks) trn->SetTag(t);
        EXPECT_EQ(trn->AllRequiredPresent(), r.expected) << r.wrapper << " with " << r.marks.size();
    }
    std::unique_ptr<OETransRq> untagged(F()->NewTransRq(1));
    untagged->SetTransUserID(OEString("1"));
    untagged->SetActualTrans(F()->NewBankStatementRq(1));
    EXPECT_EQ(untagged->AllRequiredPresent(), 0) << "a wrapper without a tag fails";
}

TEST(TransactionWrappers, ResponseNeedsItsInnerUnlessErrorOrUpToDate) {
    std::unique_ptr<OETransRs> trn(F()->NewTransRs(1));
    trn->SetType(OETAG_STMTTRNRS);
    trn->SetTransUserID(OEString("1"));
    OEStatus* status = F()->NewStatus(1);
    status->SetCode(0L);
    status->SetSeverity(OESEV_INFO);
    trn->SetStatus(status);
    EXPECT_EQ(trn->AllRequiredPresent(), 0);
    status->SetSeverity(OESEV_ERROR);
    EXPECT_EQ(trn->AllRequiredPresent(), 1);
    status->SetSeverity(OESEV_INFO);
    status->SetCode(1L);
    EXPECT_EQ(trn->AllRequiredPresent(), 1);
    EXPECT_EQ(BuildText(trn.get()), "<TRNUID>1\n<STATUS>\n<CODE>1\n<SEVERITY>INFO\n</STATUS>\n");
}

TEST(TransactionWrappers, InnerTagsWithoutAClassAnswerFour) {
    std::unique_ptr<OEFileRs> rs(F()->NewFileRs(1));
    OEParseStatus status =
        ParseInto("<OFX><INVSTMTMSGSRSV1><INVSTMTTRNRS><TRNUID>1<STATUS><CODE>0<SEVERITY>INFO"
                  "</STATUS><INVMAILRS><INVACCTFROM></INVMAILRS></INVSTMTTRNRS></INVSTMTMSGSRSV1></OFX>",
                  rs.get());
    EXPECT_EQ(status, OEPS_INVALID);
}

// White-box: the wrapper's own creation step, including the e-file tag that creates nothing.
class InnerProbe : public OETransRq {
public:
    using OETransRq::NewRq;
};

TEST(TransactionWrappers, NewRqCreatesKnownInnersAndTheEFileTagOnlyFollowsOne) {
    InnerProbe wrapper;
    wrapper.SetMsgSetVersion(1);
    wrapper.SetType(OETAG_STMTTRNRQ);
    EXPECT_EQ(wrapper.NewRq(OETAG_K_EFILERQ), OEPS_NORESOURCE) << "nothing held yet";
    EXPECT_EQ(wrapper.NewRq(OETAG_INVMAILRQ), OEPS_INVALID) << "no class for it";
    EXPECT_EQ(wrapper.GetActualTrans(), nullptr);
    ASSERT_EQ(wrapper.NewRq(OETAG_STMTRQ), OEPS_OK);
    ASSERT_NE(wrapper.GetActualTrans(), nullptr);
    EXPECT_EQ(wrapper.GetActualTrans()->GetType(), OETAG_STMTRQ);
    EXPECT_EQ(wrapper.NewRq(OETAG_K_EFILERQ), OEPS_OK);
}

TEST(Sync, ChoiceRules) {
    struct Row {
        std::vector<OETagID> marks;
        unsigned short expected;
    };
    const Row rows[] = {
        {{OETAG_REJECTIFMISSING, OETAG_TOKEN}, 1},
        {{OETAG_REJECTIFMISSING, OETAG_REFRESH}, 1},
        {{OETAG_REJECTIFMISSING, OETAG_TOKEN, OETAG_REFRESH}, 0},
        {{OETAG_REJECTIFMISSING, OETAG_TOKEN, OETAG_TOKEN2}, 0}, // the two tokens cancel
        {{OETAG_TOKEN}, 0},
    };
    for (const Row& r : rows) {
        std::unique_ptr<OESyncRq> sync(F()->NewSyncRq(1));
        sync->SetType(OETAG_ACCTSYNCRQ);
        for (OETagID t : r.marks) sync->SetTag(t);
        EXPECT_EQ(sync->AllRequiredPresent(), r.expected);
    }
    std::unique_ptr<OESyncRq> mail(F()->NewSyncRq(1));
    mail->SetType(OETAG_BANKMAILSYNCRQ);
    mail->SetRejectIfMissing(1);
    mail->SetToken(OEString("0"));
    mail->SetIncludeImages(0);
    mail->SetUseHTML(0);
    EXPECT_EQ(mail->AllRequiredPresent(), 0) << "needs exactly one account";
    mail->SetAccount(F()->NewCCAccount(1));
    EXPECT_EQ(mail->AllRequiredPresent(), 1);
}

TEST(SignOn, CredentialsRuleBuildOrderAndALongVersionTwoPassword) {
    std::unique_ptr<OESignOnRq> s(CompleteSignOn());
    EXPECT_EQ(s->AllRequiredPresent(), 0);
    s->SetUserId(OEString("me"));
    EXPECT_EQ(s->AllRequiredPresent(), 0) << "USERID without USERPASS";
    s->SetUserKey(OEString("key"));
    EXPECT_EQ(s->AllRequiredPresent(), 1);
    s->SetUserPass(OEString("secret"));
    OEFI* fi = F()->NewFI(1);
    fi->SetOrg(OEString("B"));
    s->SetFI(fi);
    s->SetSessCookie(OEString("c"));
    EXPECT_EQ(BuildText(s.get()),
              "<DTCLIENT>20240105\n<USERID>me\n<USERPASS>secret\n<USERKEY>key\n<LANGUAGE>ENG\n"
              "<FI>\n<ORG>B\n</FI>\n<SESSCOOKIE>c\n<APPID>QWIN\n<APPVER>2700\n");
    std::unique_ptr<OESignOnRq> v2(F()->NewSignOnRq(2));
    std::string longPass(171, 'p');
    EXPECT_EQ(v2->SetUserPass(OEString(longPass.c_str())), 1);
    EXPECT_NE(BuildText(v2.get()).find(longPass), std::string::npos);
}

} // namespace

namespace {

TEST(Profile, MessageSetCoreRequiredByVersionAndRepeatedElements) {
    OEDataObjFactory* f = OEDataObj::GetFactory();
    for (unsigned short version : {1, 2}) {
        std::unique_ptr<OEMessageSetCore> core(f->NewMessageSetCore(version));
        core->SetVer(1L);
        core->SetOFXSecurity(OEString("type1"));
        core->SetTransportSecurity(OEString("Y"));
        core->SetSignOnRealm(OEString("R"));
        core->SetSyncMode(OEString("LITE"));
        core->SetRespFileer(OEString("N"));
        core->AppendLanguage(OEString("ENG"));
        core->AppendLanguage(OEString("FRA"));
        EXPECT_EQ(core->AllRequiredPresent(), 0) << version;
        EXPECT_EQ(core->SetURL(OEString("https://v1")), version == 1 ? 1 : 0);
        EXPECT_EQ(core->SetURL2(OEString("https://v2")), version == 2 ? 1 : 0);
        EXPECT_EQ(core->AppendCountry(OEString("USA")), version == 2 ? 1 : 0);
        EXPECT_EQ(core->AllRequiredPresent(), 1) << version;
        std::string text = BuildText(core.get());
        EXPECT_NE(text.find("<LANGUAGE>ENG\n<LANGUAGE>FRA\n"), std::string::npos);
        std::unique_ptr<OEMessageSetCore> copy(f->NewMessageSetCore(version));
        ASSERT_EQ(copy->DeepCopyFrom(core.get()), 1);
        EXPECT_EQ(BuildText(copy.get()), text);
    }
    std::unique_ptr<OEMessageSetList> list(f->NewMessageSetList(1));
    OEMessageSetProfile* bank = f->NewMessageSetProfile(1);
    bank->SetType(OETAG_BANKMSGSET);
    ASSERT_NE(bank->NewMsgSetVersion(OETAG_BANKMSGSETV1, 1), nullptr);
    EXPECT_EQ(bank->NewMsgSetVersion(OETAG_STMTRQ, 1), nullptr);
    list->SetMessageSetProfile(bank);
    EXPECT_EQ(list->AllRequiredPresent(), 0) << "SIGNONMSGSET and PROFMSGSET are required";
    EXPECT_EQ(BuildText(list.get()), "<BANKMSGSET>\n<BANKMSGSETV1>\n</BANKMSGSETV1>\n</BANKMSGSET>\n");
}

} // namespace
