// The HTTPS transport with the built-in client against the loopback test server: real TLS,
// real certificate checks, real HTTP statuses. The server and its throw-away CA come from the
// ctest fixture (tests.cmake); without it these tests fail rather than skip.
#include "net_test_util.h"

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>

using nettest::LogCapture;

namespace {

class HttpsTest : public ::testing::Test {
protected:
    void SetUp() override {
        dir = nettest::FixtureDir();
        ASSERT_FALSE(dir.empty()) << "OESDK_NET_FIXTURE is not set: run these tests through ctest, whose "
                                     "fixture starts the loopback HTTPS server";
        port = nettest::Trim(nettest::Slurp(dir + "/port"));
        ASSERT_FALSE(port.empty()) << "the loopback HTTPS server did not start (see " << dir
                                   << "/server.err)";
        // wine matches only DNS names of a certificate, so the host is always "localhost".
        base = "https://localhost:" + port;
        ca = nettest::Slurp(dir + "/ca.der");
        other = nettest::Slurp(dir + "/other.der");
        serverId = nettest::Trim(nettest::Slurp(dir + "/srv.sha1"));
        ASSERT_EQ(serverId.size(), 40u);
        LogCapture::Clear();
        access.SetLogCallback(LogCapture::Callback);
        access.SetTempFilePath(OEString(nettest::MakeTempDir("https").c_str()));
        request = static_cast<VRNNetRequest*>(access.NewNetRequest());
        request->SetTimeout(20);
        body.WriteString(
            "OFXHEADER:100\r\nDATA:OFXSGML\r\n\r\n<OFX><SIGNONMSGSRQV1></SIGNONMSGSRQV1></OFX>\r\n");
    }
    void TearDown() override {
        if (request) access.DeleteNetRequest(request);
        access.EndConnection();
    }
    unsigned short Trust(const std::string& der, short id) {
        return request->AddTrustedRoot(reinterpret_cast<const unsigned char*>(der.data()),
                                       static_cast<unsigned short>(der.size()), id);
    }
    // Whether a whole request for this path reached the server (a body cut off after the
    // headers is logged as HEADERS-ONLY: the body, which carries the credentials, never went out).
    bool ServerSaw(const std::string& path) {
        std::string log = "\n" + nettest::Slurp(dir + "/requests.log");
        return log.find("\nPOST " + path + " ") != std::string::npos ||
               log.find("\nGET " + path + " ") != std::string::npos;
    }
    std::string Reply() {
        OEBuffer reply;
        EXPECT_EQ(request->LoadReply(&reply), OENetOK);
        return nettest::BufferText(reply);
    }

    std::string dir, port, base, ca, other, serverId;
    VRNNetAccess access;
    VRNNetRequest* request = nullptr;
    OEBuffer body;
};

TEST_F(HttpsTest, StatementRequestGoesOutAndTheAnswerComesBack) {
    ASSERT_EQ(Trust(ca, 2001), 1);
    ASSERT_EQ(request->AddExpectedSSLCertID(reinterpret_cast<const unsigned char*>(serverId.c_str()), 40), 1);
    EXPECT_EQ(request->Send(OEString((base + "/ofx?case=statement").c_str()), &body), OENetOK)
        << LogCapture::All();
    unsigned long code = 1, http = 0;
    request->GetStatus(&code, &http);
    EXPECT_EQ(code, 0u);
    EXPECT_EQ(http, 200u);
    std::string reply = Reply();
    EXPECT_EQ(reply, nettest::Slurp(std::string(OESDK_SOURCE_DIR) + "/tests/net/reply.ofx"));
    EXPECT_NE(reply.find("<STMTRS>"), std::string::npos);
    EXPECT_TRUE(LogCapture::Has("3 VRN: Received trusted root 2001 (VeriSign OFX CA)")) << LogCapture::All();
    EXPECT_TRUE(ServerSaw("/ofx?case=statement"));

    // The body arrives as sent, with the OFX content type (the server answers 415 otherwise).
    EXPECT_EQ(request->Send(OEString((base + "/echo").c_str()), &body), OENetOK);
    EXPECT_EQ(Reply(), nettest::BufferText(body));
    request->SetTimeout(0); // no HTTP settings at all: the client still posts OFX
    EXPECT_EQ(request->Send(OEString((base + "/ofx?case=notimeout").c_str()), &body), OENetOK);
}

TEST_F(HttpsTest, GetAndSavedHeaders) {
    ASSERT_EQ(Trust(ca, 4000), 1);
    request->SetSaveHeaders(1);
    EXPECT_EQ(request->Get(OEString((base + "/ofx?case=get").c_str())), OENetOK) << LogCapture::All();
    OEString value;
    EXPECT_EQ(request->GetHeader(OEString("x-oesdk-test"), value), 1);
    EXPECT_STREQ(value.c_str(), "loopback");
    EXPECT_EQ(request->GetHeader(OEString("Content-Type"), value), 1);
    EXPECT_STREQ(value.c_str(), "application/x-ofx");
    EXPECT_NE(nettest::BufferText(request->GetReplyHeaders()).find("HTTP/1."), std::string::npos);
    EXPECT_NE(Reply().find("<OFX>"), std::string::npos);
    EXPECT_TRUE(LogCapture::Has("3 VRN: End get from " + base + "/ofx?case=get, netstatus 0"));
}

TEST_F(HttpsTest, UntrustedServerIsRefusedBeforeTheRequestGoesOut) {
    ASSERT_EQ(Trust(other, 2001), 1); // same name as the server's CA, other key
    EXPECT_EQ(request->Send(OEString((base + "/ofx?case=wrongca").c_str()), &body), OENetSecurityError);
    unsigned long size = 0;
    EXPECT_EQ(request->GetReplySize(&size), OENetReplySizeFailed);
    EXPECT_FALSE(ServerSaw("/ofx?case=wrongca"));
    // An upper-case scheme skips the SSL settings but not the verification.
    std::string upper = "HTTPS" + base.substr(5) + "/ofx?case=upper";
    EXPECT_EQ(request->Send(OEString(upper.c_str()), &body), OENetSecurityError);
    EXPECT_FALSE(ServerSaw("/ofx?case=upper"));
}

TEST_F(HttpsTest, CertificateCallbackRejections) {
    struct Case {
        const char* name;
        short trustCaAs;    // 0: the server's CA is not added to the request
        bool addOther;      // a second root that does not anchor the chain
        const char* expect; // expected certificate id, or null
        unsigned long code;
        const char* line; // log line, or null
    } cases[] = {
        {"group3000", 3005, false, nullptr, 1671,
         "1 ***VRN: VeriSign Class 3 PCA is not accepted as a trusted root."},
        {"rootmismatch", 0, true, nullptr, 1670, nullptr},
        {"certid", 2001, false, "00112233445566778899AABBCCDDEEFF00112233", 1673, nullptr},
    };
    // The server's CA in the client's own store, so that the chain verifies and the root it is
    // anchored in is not one of the request's roots.
    ASSERT_EQ(OEHttpClient::GetCurrent()->ICSetTrustStoreFile((dir + "/ca.pem").c_str()), 0);
    for (const Case& c : cases) {
        LogCapture::Clear();
        VRNNetRequest* r = static_cast<VRNNetRequest*>(access.NewNetRequest());
        if (c.trustCaAs)
            r->AddTrustedRoot(reinterpret_cast<const unsigned char*>(ca.data()),
                              static_cast<unsigned short>(ca.size()), c.trustCaAs);
        if (c.addOther)
            r->AddTrustedRoot(reinterpret_cast<const unsigned char*>(other.data()),
                              static_cast<unsigned short>(other.size()), 2002);
        if (c.expect) r->AddExpectedSSLCertID(reinterpret_cast<const unsigned char*>(c.expect), 40);
        std::string path = std::string("/ofx?case=") + c.name;
        EXPECT_EQ(r->Send(OEString((base + path).c_str()), &body), OENetUnknownError) << c.name;
        EXPECT_EQ(r->GetReceiveError(), c.code) << c.name << "\n" << LogCapture::All();
        if (c.line) {
            EXPECT_TRUE(LogCapture::Has(c.line)) << LogCapture::All();
        }
        EXPECT_FALSE(ServerSaw(path)) << c.name << ": the request went out";
        access.DeleteNetRequest(r);
    }
    EXPECT_TRUE(LogCapture::Has(
        "1 ***VRN: SSL Cert ID failure: Expecting \"00112233445566778899AABBCCDDEEFF00112233\", "
        "received \"" +
        serverId + "\""))
        << LogCapture::All();

    // Two expected ids: the first two are named; a match among more ids passes.
    LogCapture::Clear();
    const char* ids[] = {"AA", "bb:cc", "FFFF"};
    for (const char* id : ids)
        request->AddExpectedSSLCertID(reinterpret_cast<const unsigned char*>(id),
                                      static_cast<unsigned short>(strlen(id)));
    EXPECT_EQ(request->Send(OEString((base + "/ofx?case=twoids").c_str()), &body), OENetUnknownError);
    EXPECT_TRUE(LogCapture::Has("1 ***VRN: SSL Cert ID failure: Expecting \"AA\" or \"bb:cc\", received \"" +
                                serverId + "\""))
        << LogCapture::All();
    std::string lower = serverId;
    for (char& ch : lower) ch = static_cast<char>(tolower(ch));
    request->AddExpectedSSLCertID(reinterpret_cast<const unsigned char*>(lower.c_str()), 40);
    EXPECT_EQ(request->Send(OEString((base + "/ofx?case=idmatch").c_str()), &body), OENetOK)
        << LogCapture::All();
    EXPECT_TRUE(LogCapture::Has("3 VRN: Received trusted root 0 (none)"));
    OEHttpClient::GetCurrent()->ICSetTrustStoreFile(nullptr);
}

TEST_F(HttpsTest, HttpStatusesMapToNetStatuses) {
    ASSERT_EQ(Trust(ca, 2001), 1);
    const struct {
        int http;
        OENetStatus status;
    } rows[] = {{404, OENetHttpClientError}, {408, OENetTimeout}, {503, OENetServerUnavailable}};
    for (const auto& row : rows) {
        std::string url = base + "/status/" + std::to_string(row.http);
        EXPECT_EQ(request->Send(OEString(url.c_str()), &body), row.status) << row.http;
        unsigned long code = 0, http = 0, size = 0;
        request->GetStatus(&code, &http);
        EXPECT_EQ(http, static_cast<unsigned long>(row.http));
        EXPECT_EQ(code, kICHttpStatusBase | static_cast<unsigned long>(row.http));
        EXPECT_EQ(request->GetReplySize(&size), OENetReplySizeFailed);
    }
    EXPECT_EQ(request->Get(OEString((base + "/status/503").c_str())), OENetServerUnavailable);
    // Redirects are not followed: the request goes to the checked server only.
    EXPECT_EQ(request->Send(OEString((base + "/redirect").c_str()), &body), OENetUnknownError);
    EXPECT_EQ(request->GetReceiveError(), kICHttpStatusBase | 307);
    EXPECT_FALSE(ServerSaw("/ofx?case=redirected"));
}

TEST_F(HttpsTest, TimeoutAndAbort) {
    ASSERT_EQ(Trust(ca, 2001), 1);
    request->SetTimeout(1);
    auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(request->Send(OEString((base + "/slow/4000").c_str()), &body), OENetTimeout);
    unsigned long code = 0, http = 0;
    request->GetStatus(&code, &http);
    EXPECT_EQ(http, 408u);
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(4));

    // Abort from the host's message pump while the request waits.
    request->SetTimeout(20);
    static VRNNetRequest* target;
    static int rounds;
    static OENetStatus aborted;
    target = request;
    rounds = 0;
    aborted = OENetUnknownError;
    OEPlatform::PumpHook old = OEPlatform::SetPumpHook(
        [](void*) -> int {
            if (++rounds == 3) aborted = target->Abort();
            return 0;
        },
        nullptr);
    start = std::chrono::steady_clock::now();
    OENetStatus s = request->Send(OEString((base + "/slow/5000").c_str()), &body);
    OEPlatform::SetPumpHook(old, nullptr);
    EXPECT_EQ(aborted, OENetOK);
    EXPECT_EQ(s, OENetUnknownError);
    EXPECT_EQ(request->GetReceiveError(), kICNetworkErrorBase | kICErrOperationCancelled);
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(4000));
}

TEST_F(HttpsTest, NothingListeningAndVerificationOff) {
    // A port on loopback that nobody listens on: the server's port + 1 is very likely free.
    std::string closed = "https://localhost:" + std::to_string(std::stoi(port) + 1) + "/ofx";
    OENetStatus s = request->Send(OEString(closed.c_str()), &body);
    EXPECT_TRUE(s == OENetCannotConnect || s == OENetSecurityError || s == OENetUnknownError) << s;
    // Verification off: the untrusted server is accepted (for a host's own test servers).
    request->SetSSLVerifyCert(0);
    EXPECT_EQ(request->Send(OEString((base + "/ofx?case=noverify").c_str()), &body), OENetOK)
        << LogCapture::All();
}

TEST(Certificate, ParsesDerAndBerAndComputesTheId) {
    std::string dir = nettest::FixtureDir();
    ASSERT_FALSE(dir.empty()) << "OESDK_NET_FIXTURE is not set";
    std::string der = nettest::Slurp(dir + "/ca.der");
    std::string id = nettest::Trim(nettest::Slurp(dir + "/ca.sha1"));
    const unsigned char* bytes = reinterpret_cast<const unsigned char*>(der.data());
    OECertificate c;
    ASSERT_EQ(c.ParseDER(bytes, der.size()), 1);
    char out[41];
    ASSERT_EQ(c.GetCertID(out, sizeof out), 1);
    EXPECT_EQ(out, id);
    EXPECT_EQ(std::string(reinterpret_cast<const char*>(c.GetDER()), c.GetDERLength()), der);

    std::string trailing = der + "x";
    EXPECT_EQ(c.ParseDER(reinterpret_cast<const unsigned char*>(trailing.data()), trailing.size()), 0);
    EXPECT_EQ(c.IsValid(), 0);
    EXPECT_EQ(c.ParseDER(bytes, der.size() - 10), 0);
    EXPECT_EQ(c.ParseDER(nullptr, 0), 0);

    // BER: the outer sequence with an indefinite length.
    ASSERT_EQ(static_cast<unsigned char>(der[1]), 0x82u);
    std::string ber = std::string("\x30\x80", 2) + der.substr(4) + std::string("\0\0", 2);
    const unsigned char* berBytes = reinterpret_cast<const unsigned char*>(ber.data());
    EXPECT_EQ(c.ParseDER(berBytes, ber.size()), 0);
    ASSERT_EQ(c.ParseBER(berBytes, ber.size()), 1);
    c.GetCertID(out, sizeof out);
    EXPECT_EQ(out, id);

    VRNNetAccess access;
    VRNNetRequest r(&access);
    EXPECT_EQ(r.AddTrustedRootBER(berBytes, static_cast<unsigned short>(ber.size()), 1000), 1);
    EXPECT_EQ(OENetRequest::SetBuiltInRoot(1000, bytes, static_cast<unsigned short>(der.size())), 1);
    EXPECT_EQ(r.AddKestivBrandingRoot(), 1);
    EXPECT_EQ(OENetRequest::SetBuiltInRoot(1000, nullptr, 0), 1);
    EXPECT_EQ(r.AddKestivBrandingRoot(), 0);
}

} // namespace
