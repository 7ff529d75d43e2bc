// Transport base: "file:" addresses, LocalAccess, the access's log and session callbacks.
#include "net_test_util.h"

#include <gtest/gtest.h>

#include <filesystem>

using nettest::LogCapture;

namespace {

struct UrlCase {
    const char* url;
    unsigned short ok;
    const char* windows;
    const char* posix;
};

TEST(FileAddress, ConvertsAsDocumented) {
    const UrlCase cases[] = {
        {"file:/dir/x.ofx", 1, "dir\\x.ofx", "dir/x.ofx"},
        {"file://dir/x.ofx", 1, "dir\\x.ofx", "dir/x.ofx"},
        {"file:///dir/x.ofx", 1, "\\dir\\x.ofx", "/dir/x.ofx"},
        {"FILE:///C|/dir/x.ofx", 1, "C:\\dir\\x.ofx", "/dir/x.ofx"},
        {"File://C|/a b/x", 1, "C:\\a b\\x", "/a b/x"},
        {"file:/C:/x", 1, "C:\\x", "/x"},
        {"http://host/x", 0, "", ""},
        {"fil:/x", 0, "", ""},
        {"file:", 0, "", ""},
        {"", 0, "", ""},
    };
    for (const UrlCase& c : cases) {
        char out[256] = "junk";
        EXPECT_EQ(OENetRequest::ConvertFileURLToLocalFileName(out, sizeof out, c.url), c.ok) << c.url;
#if defined(_WIN32)
        EXPECT_STREQ(out, c.windows) << c.url;
#else
        EXPECT_STREQ(out, c.posix) << c.url;
#endif
    }
    char tiny[4];
    EXPECT_EQ(OENetRequest::ConvertFileURLToLocalFileName(tiny, sizeof tiny, "file:///long/path"), 0);
    EXPECT_STREQ(tiny, "");
    EXPECT_EQ(OENetRequest::HasFileScheme("FiLe:x"), 1);
    EXPECT_EQ(OENetRequest::HasFileScheme("files"), 0);
    EXPECT_EQ(OENetRequest::HasFileScheme(nullptr), 0);
}

TEST(FileAddress, ReverseMapping) {
    const char* rows[][2] = {{"C:\\dir\\x.ofx", "file:///C|/dir/x.ofx"},
                             {"/home/u/x.ofx", "file:///home/u/x.ofx"},
                             {"rel/x.ofx", "file:/rel/x.ofx"}};
    for (auto& row : rows) {
        char url[256];
        ASSERT_EQ(OENetRequest::ConvertLocalFileNameToFileURL(url, sizeof url, row[0]), 1);
        EXPECT_STREQ(url, row[1]);
    }
    char tiny[8];
    EXPECT_EQ(OENetRequest::ConvertLocalFileNameToFileURL(tiny, sizeof tiny, "/a/long/name"), 0);
}

// The address as a host writes it for a file: upper-case scheme, three slashes, a drive with a
// bar, forward slashes.
std::string UrlFor(const std::string& path) {
    std::string p = path;
    for (char& c : p)
        if (c == '\\') c = '/';
    if (p.size() > 1 && p[1] == ':') return "FILE:///" + p.substr(0, 1) + "|" + p.substr(2);
    return "FILE:///C|" + p; // POSIX: the drive is dropped again
}

TEST(LocalAccess, ReadsTheFileAnAddressNames) {
    std::string dir = nettest::MakeTempDir("local");
    std::string path = (std::filesystem::path(dir) / "reply.ofx").string();
    std::string text = "OFXHEADER:100\r\n\r\n<OFX></OFX>\r\n";
    nettest::WriteFile(path, text);

    LocalAccess access;
    OENetRequest* r = access.NewNetRequest();
    ASSERT_NE(r, nullptr);
    EXPECT_EQ(r->Get(OEString(UrlFor(path).c_str())), OENetOK);
    unsigned long size = 0;
    EXPECT_EQ(r->GetReplySize(&size), OENetOK);
    EXPECT_EQ(size, text.size());
    OEBuffer reply;
    EXPECT_EQ(r->LoadReply(&reply), OENetOK);
    EXPECT_EQ(nettest::BufferText(reply), text);
    // Sending to a file address reads the reply from it.
    OEBuffer body;
    body.WriteString("request");
    EXPECT_EQ(r->Send(OEString(UrlFor(path).c_str()), &body), OENetOK);
    EXPECT_EQ(nettest::Slurp(path), text);

    EXPECT_EQ(r->Get(OEString(UrlFor(path + ".missing").c_str())), OENetOK);
    EXPECT_EQ(r->GetReplySize(&size), OENetReplySizeFailed);
    EXPECT_EQ(r->LoadReply(&reply), OENetReplyLoadFailed);

    EXPECT_EQ(r->Get(OEString("http://127.0.0.1/x")), OENetNotHandled);
    EXPECT_EQ(r->GetReplySize(&size), OENetReplySizeFailed);
    EXPECT_EQ(r->LoadReply(&reply), OENetReplyLoadFailed);
    EXPECT_EQ(r->Abort(), OENetOK);
    access.DeleteNetRequest(r);
}

TEST(LocalAccess, EmptyFileAndBufferFailure) {
    std::string dir = nettest::MakeTempDir("empty");
    std::string path = (std::filesystem::path(dir) / "e.ofx").string();
    nettest::WriteFile(path, "");
    OENetRequest r;
    ASSERT_EQ(r.Get(OEString(UrlFor(path).c_str())), OENetOK);
    OEBuffer reply;
    EXPECT_EQ(r.LoadReply(&reply), OENetOK);
    EXPECT_EQ(reply.GetBufferSize(), 0u);

    nettest::WriteFile(path, std::string(5000, 'x'));
    OEMemory::SetFailureHook([](std::size_t) { return 1; });
    OEBuffer none;
    OENetStatus s = r.LoadReply(&none);
    OEMemory::SetFailureHook(nullptr);
    OEThreadState::SetErrorCode(0);
    EXPECT_EQ(s, OENetOutOfMemory);
}

OEOpCode g_op;
unsigned long g_done, g_total;
void SessionCallback(OEOpCode op, void* a, void* b) {
    g_op = op;
    g_done = *static_cast<unsigned long*>(a);
    g_total = *static_cast<unsigned long*>(b);
}

TEST(LocalAccess, CallbacksAndDefaults) {
    LocalAccess access;
    access.LogMessage("dropped", 1, ""); // no callback: nothing happens
    LogCapture::Clear();
    access.SetLogCallback(LogCapture::Callback);
    access.LogMessage("hello", 3, "x");
    access.LogFormat(1, "***VRN: %s %d", "n", 5);
    EXPECT_TRUE(LogCapture::Has("3 hello"));
    EXPECT_TRUE(LogCapture::Has("1 ***VRN: n 5"));
    access.SetSessionCallback(SessionCallback);
    access.Progress(10, 20);
    EXPECT_EQ(g_op, OEOpProgress);
    EXPECT_EQ(g_done, 10u);
    EXPECT_EQ(g_total, 20u);

    OEString temp;
    VRNNetAccess::SetupTempPathFromHInst(nullptr, temp);
    OEFileStat st;
    ASSERT_EQ(_LD_stat(temp.c_str(), &st), 0) << temp.c_str();
    EXPECT_EQ(st.isDirectory, 1u);
}

} // namespace
