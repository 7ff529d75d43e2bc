// Manual exchange through SEND.DAT and RECV.DAT.
#include "net_test_util.h"

#include <gtest/gtest.h>

#include <filesystem>

namespace {

class ScriptedRequest : public ReceiverRequest {
public:
    ScriptedRequest(std::string dir, int answer) : m_dir(std::move(dir)), m_answer(answer) {}
    std::string prompt;
    std::string Path(const char* name) const { return (std::filesystem::path(m_dir) / name).string(); }

protected:
    void BuildFileSpec(const char* name, char* out) override {
        std::snprintf(out, 1024, "%s", Path(name).c_str());
    }
    int RRYesNoMsg(const char* text) override {
        prompt = text;
        return m_answer;
    }

private:
    std::string m_dir;
    int m_answer;
};

const char kPromptText[] = "Go to the directory that contains LDW.INI. "
                           "There you will find a SEND.DAT file containing your requests.\n\n"
                           "If you wish to continue, copy or create a RECV.DAT file and press YES.\n"
                           "If you wish to cancel, press NO.";

TEST(Receiver, YesReadsRecvDat) {
    std::string dir = nettest::MakeTempDir("recv-yes");
    ScriptedRequest r(dir, 1);
    std::string body(25000, 'q'); // several blocks
    OEBuffer buffer;
    buffer.WriteLarge(body.data(), body.size());
    nettest::WriteFile(r.Path("RECV.DAT"), "answer");
    EXPECT_EQ(r.Send(OEString("file:ignored"), &buffer), OENetOK);
    EXPECT_EQ(r.prompt, kPromptText);
    EXPECT_EQ(nettest::Slurp(r.Path("SEND.DAT")), body);
    unsigned long size = 0;
    EXPECT_EQ(r.GetReplySize(&size), OENetOK);
    EXPECT_EQ(size, 6u);
    OEBuffer reply;
    EXPECT_EQ(r.LoadReply(&reply), OENetOK);
    EXPECT_EQ(nettest::BufferText(reply), "answer");
    EXPECT_TRUE(nettest::Exists(r.Path("RECV.DAT"))); // the reply file stays
}

TEST(Receiver, NoAndMissingAndChangedReplies) {
    std::string dir = nettest::MakeTempDir("recv-no");
    OEBuffer body;
    body.WriteString("<OFX>");
    {
        ScriptedRequest no(dir, 0);
        EXPECT_EQ(no.Send(OEString(""), &body), OENetOpenFailed);
        EXPECT_EQ(nettest::Slurp(no.Path("SEND.DAT")), "<OFX>");
    }
    ScriptedRequest yes(dir, 1);
    EXPECT_EQ(yes.Send(OEString(""), &body), OENetOK); // no RECV.DAT yet
    unsigned long size = 0;
    EXPECT_EQ(yes.GetReplySize(&size), OENetReplySizeFailed);
    OEBuffer reply;
    EXPECT_EQ(yes.LoadReply(&reply), OENetReplyLoadFailed);

    nettest::WriteFile(yes.Path("RECV.DAT"), "short");
    EXPECT_EQ(yes.Get(OEString("")), OENetOK);
    nettest::WriteFile(yes.Path("RECV.DAT"), "longer now");
    OEBuffer changed;
    EXPECT_EQ(yes.LoadReply(&changed), OENetReplyLoadFailed);

    ScriptedRequest unwritable((std::filesystem::path(dir) / "no-such-dir").string(), 1);
    EXPECT_EQ(unwritable.Send(OEString(""), &body), OENetOpenFailed);
    EXPECT_EQ(unwritable.prompt, "");
}

TEST(Receiver, AccessAndIgnoredCertificates) {
    ReceiverAccess access;
    OENetRequest* r = access.NewNetRequest();
    ASSERT_NE(dynamic_cast<ReceiverRequest*>(r), nullptr);
    const unsigned char junk[] = {1, 2, 3};
    EXPECT_EQ(r->AddTrustedRoot(junk, 3, 1000), 1);
    EXPECT_EQ(r->AddTrustedRootBER(junk, 3, 2000), 1);
    EXPECT_EQ(r->AddExpectedSSLCertID(junk, 3), 1);
    EXPECT_EQ(r->AddExpectedSSLCertName(OEString("x")), 1);
    // The base asks nobody and answers no.
    OEBuffer body;
    std::string cwd = std::filesystem::current_path().string();
    std::filesystem::current_path(nettest::MakeTempDir("recv-cwd"));
    EXPECT_EQ(r->Send(OEString(""), &body), OENetOpenFailed);
    EXPECT_TRUE(nettest::Exists("SEND.DAT"));
    std::filesystem::current_path(cwd);
    access.DeleteNetRequest(r);
}

} // namespace
