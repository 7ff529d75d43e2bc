// HTTPS request logic against a scripted HTTP client: the order of client calls, the log lines,
// the status mappings, the session handling and the certificate check.
#include "net_test_util.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <thread>

#if defined(_WIN32)
#include <windows.h>
#endif

using nettest::LogCapture;

namespace {

class FakeClient : public OEHttpClient {
public:
    std::vector<std::string> calls;
    long openError = 0, connectResult = 0, closeResult = 0, sendResult = 0, sslResult = 0, httpResult = 0,
         initiateResult = 0, cancelResult = 0;
    bool complete = true;   // ICInitiate finishes the transfer (on another thread)
    unsigned long code = 0; // completion code handed back
    std::string replyBody = "reply";
    std::string dir;
    ICCompletionCallback callback = nullptr;
    void* context = nullptr;
    std::string lastHttpInfo;
    int session = 0;

    long ICNeedsInternetSetup() override { return 0; }
    ICSession ICOpenInet(long* error, const char* agent) override {
        calls.push_back(std::string("open ") + agent);
        *error = openError;
        return openError ? nullptr : &session;
    }
    long ICConnect(long) override {
        calls.push_back("connect");
        return connectResult;
    }
    long ICCloseInet(ICSession) override {
        calls.push_back("close");
        return closeResult;
    }
    ICRequest ICSendDataRequest(long* result, ICSession, const char* url, const char* body,
                                unsigned long length, const char*, ICCompletionCallback cb,
                                void* ctx) override {
        calls.push_back("send " + std::string(url) + " " + std::string(body, length));
        callback = cb;
        context = ctx;
        *result = sendResult;
        return sendResult ? nullptr : this;
    }
    ICRequest ICGetFileRequest(long* result, ICSession, const char* url, const char*, ICCompletionCallback cb,
                               void* ctx) override {
        calls.push_back("get " + std::string(url));
        callback = cb;
        context = ctx;
        *result = sendResult;
        return sendResult ? nullptr : this;
    }
    long ICSetSSLInfo(ICRequest, long ignore) override {
        calls.push_back("ssl " + std::to_string(ignore));
        return sslResult;
    }
    long ICSetHTTPInfo(ICRequest, long reserved, long post, const char* type, const char* headers,
                       long noCache, long timeout) override {
        calls.push_back("http");
        lastHttpInfo = std::to_string(reserved) + "|" + std::to_string(post) + "|" +
                       (type ? type : "(null)") + "|" + (headers ? headers : "(null)") + "|" +
                       std::to_string(noCache) + "|" + std::to_string(timeout);
        return httpResult;
    }
    long ICAddTrustedRoot(ICRequest, const unsigned char*, unsigned long, short id) override {
        calls.push_back("root " + std::to_string(id));
        return 0;
    }
    long ICSetCertificateCallback(ICRequest, ICCertificateCallback, void*) override { return 0; }
    bool pending = false;
    // A transfer left hanging ends late, as a real one does after a cancel.
    void FinishPending() {
        if (!pending) return;
        pending = false;
        ICCallbackData done{};
        done.code = kICNetworkErrorBase | kICErrOperationCancelled;
        callback(kICStatusFinished, &done, context);
    }
    long ICInitiate(ICSession, ICRequest, long, long) override {
        calls.push_back("initiate");
        pending = !complete && !initiateResult;
        if (initiateResult || !complete) return initiateResult;
        std::thread([this] {
            std::string reply = dir + "/reply.tmp", head = dir + "/head.tmp";
            nettest::WriteFile(reply, replyBody);
            nettest::WriteFile(head,
                               "HTTP/1.1 200 OK\r\nContent-Type: application/x-ofx\r\nX-Test:  a b \r\n\r\n");
            ICCallbackData progress{};
            progress.value[0] = kICProgressReceiving;
            progress.value[1] = 3;
            progress.value[3] = 9;
            callback(kICStatusProgress, &progress, context);
            ICCallbackData done{};
            done.replyFile = reply.c_str();
            done.headerFile = head.c_str();
            done.code = code;
            callback(kICStatusFinished, &done, context);
        }).detach();
        return 0;
    }
    long ICCancel(ICSession, ICRequest) override {
        calls.push_back("cancel");
        return cancelResult;
    }
    std::string Calls() const {
        std::string s;
        for (const auto& c : calls) s += c + ";";
        return s;
    }
};

class VrnTest : public ::testing::Test {
protected:
    void SetUp() override {
        client.dir = nettest::MakeTempDir("vrn");
        previous = OEHttpClient::SetCurrent(&client);
        LogCapture::Clear();
        access.SetLogCallback(LogCapture::Callback);
        request = static_cast<VRNNetRequest*>(access.NewNetRequest());
        body.WriteString("BODY");
    }
    void TearDown() override {
        access.DeleteNetRequest(request);
        client.FinishPending();
        access.EndConnection();
        OEHttpClient::SetCurrent(previous);
    }
    FakeClient client;
    OEHttpClient* previous = nullptr;
    VRNNetAccess access;
    VRNNetRequest* request = nullptr;
    OEBuffer body;
};

TEST_F(VrnTest, SendCallsTheClientInOrderAndLoadsTheReply) {
    request->SetTimeout(30);
    ASSERT_EQ(request->SendPlusHeaders(OEString("https://h/ofx"), &body, "X-A: 1\r\n"), OENetOK);
    EXPECT_EQ(client.Calls(), "open NONAME;connect;send https://h/ofx BODY;ssl 0;http;initiate;");
    EXPECT_EQ(client.lastHttpInfo, "0|1|application/x-ofx|X-A: 1\r\n|1|30");
    EXPECT_TRUE(LogCapture::Has("3 VRN: Beginning send to https://h/ofx"));
    EXPECT_TRUE(LogCapture::Has("3 VRN: End send to https://h/ofx, netstatus 0"));
    unsigned long code = 9, http = 0, size = 0;
    request->GetStatus(&code, &http);
    EXPECT_EQ(code, 0u);
    EXPECT_EQ(http, 200u);
    EXPECT_EQ(request->GetReplySize(&size), OENetOK);
    EXPECT_EQ(size, 5u);
    OEBuffer reply;
    EXPECT_EQ(request->LoadReply(&reply), OENetOK);
    EXPECT_EQ(nettest::BufferText(reply), "reply");
    EXPECT_FALSE(nettest::Exists(client.dir + "/reply.tmp")); // the client's files are gone
    EXPECT_FALSE(nettest::Exists(client.dir + "/head.tmp"));
    EXPECT_EQ(request->LoadReply(&reply), OENetReplyLoadFailed);
}

TEST_F(VrnTest, SchemeTestIsCaseSensitiveAndTimeoutZeroSetsNoHttpInfo) {
    request->SetSSLVerifyCert(0);
    ASSERT_EQ(request->SendPlusHeadersContent(OEString("HTTPS://h/ofx"), &body, "X: y", "text/x"), OENetOK);
    EXPECT_EQ(client.Calls(), "open NONAME;connect;send HTTPS://h/ofx BODY;initiate;");
    client.calls.clear();
    ASSERT_EQ(request->Send(OEString("https://h/ofx"), &body), OENetOK);
    EXPECT_EQ(client.Calls(), "send https://h/ofx BODY;ssl 1;initiate;"); // session reused, verify off
    client.calls.clear();
    request->SetTimeout(5);
    ASSERT_EQ(request->Get(OEString("http://h/x")), OENetOK);
    EXPECT_EQ(client.Calls(), "get http://h/x;http;initiate;");
    EXPECT_EQ(client.lastHttpInfo, "0|0|(null)|(null)|1|5");
    EXPECT_TRUE(LogCapture::Has("3 VRN: End get from http://h/x, netstatus 0"));
}

TEST_F(VrnTest, SetupFailuresAndTheirLogLines) {
    struct Case {
        long FakeClient::*field;
        long value;
        bool get;
        OENetStatus status;
        const char* line;
    } cases[] = {
        {&FakeClient::sendResult, 5, false, OENetRequestFailed, "1 ***VRN ICSendDataRequest:  5"},
        {&FakeClient::sendResult, 6, true, OENetRequestFailed, "1 ***VRN: ICGetFileRequest returns 6"},
        {&FakeClient::sslResult, 7, false, OENetSSLSetupFailed, "1 ***VRN ICSetSSLInfo:  7 (Send)"},
        {&FakeClient::sslResult, 8, true, OENetSSLSetupFailed, "1 ***VRN ICSetSSLInfo:  8 (Get)"},
        {&FakeClient::httpResult, 9, false, OENetOK, "1 ***VRN ICSetHTTPInfo:  9"}, // reported as success
        {&FakeClient::initiateResult, 10, false, OENetInitiateFailed, "1 ***VRN ICInitiate:  10"},
        {&FakeClient::initiateResult, 11, true, OENetInitiateFailed, "1 ***VRN: ICInitiate returns 11"},
    };
    request->SetTimeout(1);
    for (const Case& c : cases) {
        client.*c.field = c.value;
        client.calls.clear();
        LogCapture::Clear();
        OENetStatus s =
            c.get ? request->Get(OEString("https://h/")) : request->Send(OEString("https://h/"), &body);
        EXPECT_EQ(s, c.status) << c.line;
        EXPECT_TRUE(LogCapture::Has(c.line)) << LogCapture::All();
        if (c.field == &FakeClient::httpResult) {
            EXPECT_EQ(client.Calls().find("initiate"), std::string::npos);
        }
        client.*c.field = 0;
    }
    LogCapture::Clear();
    EXPECT_EQ(request->Get(OEString("")), OENetRequestFailed);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN: ICGetFileRequest returns 3"));
    EXPECT_EQ(request->Get(OEString("File:///nothing")), OENetOK); // the base answers file addresses
}

TEST_F(VrnTest, CompletionCodesMapToStatuses) {
    client.code = kICHttpStatusBase | 503;
    request->SetSaveHeaders(1);
    EXPECT_EQ(request->Send(OEString("http://h/"), &body), OENetServerUnavailable);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN kVRFInished: returns 67305975"));
    unsigned long code = 0, http = 0, size = 0;
    request->GetStatus(&code, &http);
    EXPECT_EQ(http, 503u);
    EXPECT_EQ(request->GetReceiveError(), kICHttpStatusBase | 503);
    EXPECT_EQ(request->GetReplySize(&size), OENetReplySizeFailed); // a failed reply is dropped
    EXPECT_FALSE(nettest::Exists(client.dir + "/reply.tmp"));
    OEString value;
    EXPECT_EQ(request->GetHeader(OEString("x-test"), value), 1); // headers were saved first
    EXPECT_STREQ(value.c_str(), "a b ");
    EXPECT_EQ(request->GetHeader(OEString("Missing"), value), 0);

    client.code = 0;
    client.replyBody = ""; // success without a body: nothing to load
    EXPECT_EQ(request->Send(OEString("http://h/"), &body), OENetOK);
    OEBuffer reply;
    EXPECT_EQ(request->LoadReply(&reply), OENetReplyLoadFailed);
}

TEST(VrnMapping, CompletionCodeTable) {
    const unsigned long H = kICHttpStatusBase, N = kICNetworkErrorBase;
    const struct {
        unsigned long code;
        OENetStatus status;
        unsigned long http;
    } rows[] = {
        {0, OENetOK, 200},
        {H | 201, OENetUnknownError, 201},
        {H | 304, OENetUnknownError, 304},
        {H | 400, OENetHttpClientError, 400},
        {H | 407, OENetHttpClientError, 407},
        {H | 408, OENetTimeout, 408},
        {H | 409, OENetHttpClientError, 200},
        {H | 415, OENetHttpClientError, 200},
        {H | 416, OENetUnknownError, 200},
        {H | 500, OENetUnknownError, 500},
        {H | 501, OENetNotImplemented, 501},
        {H | 502, OENetNotImplemented, 502},
        {H | 503, OENetServerUnavailable, 503},
        {H | 504, OENetServerUnavailable, 504},
        {H | 505, OENetUnknownError, 200},
        {kICNotAvailable, OENetNotAvailable, 200},
        {N | 12002, OENetTimeout, 408},
        {N | 12007, OENetServerUnavailable, 504},
        {N | 12029, OENetCannotConnect, 200},
        {N | 12037, OENetSecurityError, 200},
        {N | 12157, OENetSecurityError, 200},
        {N | 12017, OENetUnknownError, 200},
        {1670, OENetUnknownError, 200},
    };
    for (const auto& r : rows) {
        EXPECT_EQ(VRNNetRequest::MapNetStatus(r.code), r.status) << std::hex << r.code;
        EXPECT_EQ(VRNNetRequest::MapHttpStatus(r.code), r.http) << std::hex << r.code;
    }
    EXPECT_STREQ(VRNNetRequest::RootGroupName(0), "none");
    EXPECT_STREQ(VRNNetRequest::RootGroupName(1999), "Kestiv Branding CA");
    EXPECT_STREQ(VRNNetRequest::RootGroupName(2001), "VeriSign OFX CA");
    EXPECT_STREQ(VRNNetRequest::RootGroupName(4000), "RSA Secure Server CA");
    EXPECT_STREQ(VRNNetRequest::RootGroupName(5000), "unknown");
}

TEST_F(VrnTest, SessionOpenConnectAndClose) {
    client.openError = 4;
    EXPECT_EQ(request->Send(OEString("http://h/"), &body), OENetOpenFailed);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN: ICOpenInet returns 4"));
    unsigned long last = 0;
    access.GetStatus(&last);
    EXPECT_EQ(last, 4u);
    client.openError = 0;

    client.connectResult = 2200;
    EXPECT_EQ(access.OpenInternetIfNeeded(), OENetNotAvailable);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN: ICConnect returns 2200"));
    client.connectResult = 3;
    EXPECT_EQ(access.OpenInternetIfNeeded(), OENetOpenFailed);
    client.connectResult = 0;
    client.calls.clear();
    EXPECT_EQ(access.OpenInternetIfNeeded(), OENetOK);
    EXPECT_EQ(access.OpenInternetIfNeeded(), OENetOK); // connected: nothing more
    EXPECT_EQ(client.Calls(), "connect;");

    client.closeResult = 12;
    EXPECT_EQ(access.EndConnection(), OENetCloseFailed);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN: ICCloseInet returns 12"));
    EXPECT_EQ(access.GetSession(), nullptr);
    client.closeResult = 0;

    // A host-owned session is used as it is: never opened, never closed here.
    int hostSession = 0;
    access.SetGlobalState(&hostSession);
    client.calls.clear();
    EXPECT_EQ(request->Send(OEString("http://h/"), &body), OENetOK);
    EXPECT_EQ(access.EndConnection(), OENetOK);
    EXPECT_EQ(client.Calls(), "connect;send http://h/ BODY;initiate;");
}

TEST_F(VrnTest, AbortCancelsALiveRequestOnly) {
    EXPECT_EQ(request->Abort(), OENetOK); // nothing running
    EXPECT_EQ(client.Calls(), "");
    client.complete = false;
    client.cancelResult = 21;
    static VRNNetRequest* target;
    static OENetStatus abortStatus;
    static int rounds;
    target = request;
    rounds = 0;
    // The host's pump runs while the request waits: abort from there, then let the wait end.
    OEPlatform::PumpHook old = OEPlatform::SetPumpHook(
        [](void*) -> int {
            if (++rounds == 2) abortStatus = target->Abort();
            return rounds >= 3 ? 1 : 0;
        },
        nullptr);
    OENetStatus s = request->Send(OEString("http://h/"), &body);
    OEPlatform::SetPumpHook(old, nullptr);
#if defined(_WIN32)
    MSG msg;
    PeekMessageA(&msg, nullptr, WM_QUIT, WM_QUIT, PM_REMOVE);
#endif
    EXPECT_EQ(abortStatus, OENetCancelFailed);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN ICCancel:  21"));
    EXPECT_EQ(s, OENetOK); // the wait ended without a completion: no code, no reply
    EXPECT_EQ(rounds, 3);
}

#if defined(_WIN32)
TEST_F(VrnTest, QuitMessageEndsTheWaitAndIsPostedAgain) {
    client.complete = false;
    PostQuitMessage(7);
    DWORD start = GetTickCount();
    EXPECT_EQ(request->Send(OEString("http://h/"), &body), OENetOK);
    EXPECT_LT(GetTickCount() - start, 2000u);
    MSG msg;
    ASSERT_TRUE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
    EXPECT_EQ(msg.message, static_cast<UINT>(WM_QUIT));
    EXPECT_EQ(msg.wParam, 7u);
}
#endif

unsigned long g_done, g_total;
TEST_F(VrnTest, ProgressReachesTheSessionCallback) {
    access.SetSessionCallback([](OEOpCode, void* a, void* b) {
        g_done = *static_cast<unsigned long*>(a);
        g_total = *static_cast<unsigned long*>(b);
    });
    ASSERT_EQ(request->Send(OEString("http://h/"), &body), OENetOK);
    EXPECT_EQ(g_done, 3u);
    EXPECT_EQ(g_total, 9u);
    ICCallbackData sending{};
    sending.value[0] = kICProgressSending;
    sending.value[2] = 4;
    sending.value[4] = 8;
    request->DoCallback(kICStatusProgress, &sending);
    EXPECT_EQ(g_done, 4u);
    EXPECT_EQ(g_total, 8u);
    sending.value[0] = kICProgressConnecting;
    request->DoCallback(kICStatusProgress, &sending);
    EXPECT_EQ(g_done, 0u);
}

TEST_F(VrnTest, CertificateCheckRules) {
    // No trusted roots: only group 3000 and unusable chains are refused here.
    EXPECT_EQ(request->CheckCertificate(nullptr, 0, 0, 55), 55);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN: SSL certificate error: 55"));
    EXPECT_EQ(request->CheckCertificate(nullptr, 0, 3999, 0), 1671);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN: VeriSign Class 3 PCA is not accepted as a trusted root."));
    EXPECT_EQ(request->CheckCertificate(nullptr, 0, 0, 0), 1670);
    const unsigned char junk[] = {0x30, 0x03, 1, 2, 3};
    ICCertificate bad{junk, sizeof junk};
    EXPECT_EQ(request->CheckCertificate(&bad, 1, 0, 0), 1670);
    EXPECT_EQ(request->AddTrustedRoot(junk, sizeof junk, 2000), 0);

    EXPECT_EQ(request->AddExpectedSSLCertName(OEString("Bank.Example")), 1);
    EXPECT_EQ(request->IsAnExpectedSSLCertName(OEString("bank.example")), 1);
    EXPECT_EQ(request->IsAnExpectedSSLCertName(OEString("bank.example.org")), 0);
    // No built-in certificate registered: nothing is added.
    EXPECT_EQ(request->AddVeriSignOFXCARoot(), 0);
    EXPECT_EQ(OENetRequest::SetBuiltInRoot(3000, junk, sizeof junk), 0);
}

} // namespace
