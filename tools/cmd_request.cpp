// oesdk request statement ...: builds a complete statement request file (headers, sign-on,
// STMTTRNRQ/STMTRQ or CCSTMTTRNRQ/CCSTMTRQ) with the builder, ready to send.
#include "command.h"
#include "support.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <map>

namespace {

const char kUsage[] =
    "usage: oesdk request statement --account ID (--bank-id ID --type TYPE | --cc)\n"
    "                               [--from YYYYMMDD] [--to YYYYMMDD] [--user ID] [--password PW]\n"
    "                               [--org ORG] [--fid FID] [--app-id ID] [--app-ver N]\n"
    "                               [--trnuid ID] [--xml] [-o OUT]\n"
    "  TYPE is CHECKING, SAVINGS, MONEYMRKT or CREDITLINE; the password may also come from the\n"
    "  environment variable OESDK_PASSWORD.\n";

std::string UtcNow() {
    std::time_t now = std::time(nullptr);
    std::tm parts{};
#ifdef _WIN32
    gmtime_s(&parts, &now);
#else
    gmtime_r(&now, &parts);
#endif
    char text[32];
    std::strftime(text, sizeof(text), "%Y%m%d%H%M%S", &parts);
    return text;
}

int Fail(const char* message) {
    std::fprintf(stderr, "oesdk request statement: %s\n", message);
    return 1;
}

int Statement(int argc, char** argv) {
    std::map<std::string, std::string> opt;
    bool cc = false, xml = false;
    static const char* const valued[] = {"--bank-id", "--account",  "--type", "--from", "--to",
                                         "--user",    "--password", "--org",  "--fid",  "--app-id",
                                         "--app-ver", "--trnuid",   "-o"};
    for (int i = 0; i < argc; ++i) {
        std::string a = argv[i];
        if (a == "--cc") {
            cc = true;
            continue;
        }
        if (a == "--xml") {
            xml = true;
            continue;
        }
        bool known = false;
        for (const char* v : valued)
            if (a == v) known = true;
        if (!known || i + 1 >= argc) {
            std::fputs(kUsage, stderr);
            return 2;
        }
        opt[a] = argv[++i];
    }
    if (!opt.count("--account") || (!cc && (!opt.count("--bank-id") || !opt.count("--type")))) {
        std::fputs(kUsage, stderr);
        return 2;
    }
    if (!opt.count("--password") && std::getenv("OESDK_PASSWORD"))
        opt["--password"] = std::getenv("OESDK_PASSWORD");

    OEDataObjFactory* f = OEDataObj::GetFactory();
    if (!f) return Fail("out of memory");
    std::unique_ptr<OEFileRq> file(f->NewFileRq(1));
    OERequest* request = f->NewRequest(1);
    if (!file || !request || !file->AppendRequest(request)) return Fail("out of memory");
    file->AddDefaultOFXHeaders(1);

    // Sign-on.
    OEMessageSetRq* signOnSet = f->NewMessageSetRq(1);
    OESignOnRq* signOn = f->NewSignOnRq(1);
    if (!signOnSet || !signOn) return Fail("out of memory");
    signOnSet->SetType(OETAG_SIGNONMSGSRQV1);
    request->AppendMessageSet(signOnSet);
    signOnSet->SetSignOnRq(signOn);
    signOn->SetDtClient(OEString(UtcNow().c_str()));
    if (opt.count("--user")) signOn->SetUserId(OEString(opt["--user"].c_str()));
    if (opt.count("--password")) signOn->SetUserPass(OEString(opt["--password"].c_str()));
    signOn->SetLanguage(OEString("ENG"));
    if (opt.count("--org") || opt.count("--fid")) {
        OEFI* fi = f->NewFI(1);
        if (!fi) return Fail("out of memory");
        signOn->SetFI(fi);
        if (opt.count("--org")) fi->SetOrg(OEString(opt["--org"].c_str()));
        if (opt.count("--fid")) fi->SetFId(OEString(opt["--fid"].c_str()));
    }
    signOn->SetAppId(OEString(opt.count("--app-id") ? opt["--app-id"].c_str() : "QWIN"));
    if (!signOn->SetAppVer(OEString(opt.count("--app-ver") ? opt["--app-ver"].c_str() : "2700")))
        return Fail("--app-ver must be a number from 0 to 65535");

    // The statement request in its wrapper.
    OEMessageSetRq* set = f->NewMessageSetRq(1);
    OETransRq* wrapper = f->NewTransRq(1);
    OEIncTransaction* inc = f->NewIncTransaction(1);
    if (!set || !wrapper || !inc) return Fail("out of memory");
    set->SetType(cc ? OETAG_CREDITCARDMSGSRQV1 : OETAG_BANKMSGSRQV1);
    request->AppendMessageSet(set);
    wrapper->SetType(cc ? OETAG_CCSTMTTRNRQ : OETAG_STMTTRNRQ);
    set->AppendTrans(wrapper);
    std::string trnuid = opt.count("--trnuid") ? opt["--trnuid"] : "OESDK-" + UtcNow();
    wrapper->SetTransUserID(OEString(trnuid.c_str()));
    if (opt.count("--from") && !inc->SetDateStart(OEString(opt["--from"].c_str())))
        return Fail("--from is not a date");
    if (opt.count("--to") && !inc->SetDateEnd(OEString(opt["--to"].c_str())))
        return Fail("--to is not a date");
    inc->SetInclude(static_cast<unsigned short>(1));
    if (cc) {
        OECCStatementRq* stmt = f->NewCCStatementRq(1);
        OECCAccount* account = f->NewCCAccount(1);
        if (!stmt || !account) return Fail("out of memory");
        wrapper->SetActualTrans(stmt);
        stmt->SetAccountFrom(account);
        account->SetAcctId(OEString(opt["--account"].c_str()));
        stmt->SetIncTransaction(inc);
    } else {
        OEBankStatementRq* stmt = f->NewBankStatementRq(1);
        OEBankAccount* account = f->NewBankAccount(1);
        if (!stmt || !account) return Fail("out of memory");
        wrapper->SetActualTrans(stmt);
        stmt->SetAccountFrom(account);
        account->SetBankId(OEString(opt["--bank-id"].c_str()));
        account->SetAcctId(OEString(opt["--account"].c_str()));
        if (!account->SetAcctType(OEString(opt["--type"].c_str())))
            return Fail("--type must be CHECKING, SAVINGS, MONEYMRKT, CREDITLINE or UNKNOWN");
        stmt->SetIncTransaction(inc);
    }

    Document doc;
    doc.file.reset(file.release());
    doc.request = true;
    std::string text;
    int status = WriteDocument(doc, xml, text);
    if (status != OEBS_OK) {
        std::fprintf(stderr, "oesdk request statement: build status %d\n", status);
        return 1;
    }
    // A request must be complete before it is sent.
    OEDataObj* missingIn = nullptr;
    OETagID missingTag = OETAG_NONE;
    if (!OEUtility::AllRequiredPresent(doc.file.get(), &missingIn, &missingTag)) {
        std::fprintf(stderr, "oesdk request statement: %s lacks %s (give --user with --password)\n",
                     missingIn ? TagName(missingIn->GetType()).c_str() : "the request",
                     TagName(missingTag).c_str());
        return 1;
    }
    if (!WriteOutput(opt.count("-o") ? opt["-o"].c_str() : nullptr, text))
        return Fail("cannot write the output");
    return 0;
}

int Run(int argc, char** argv) {
    if (argc >= 1 && std::strcmp(argv[0], "statement") == 0) return Statement(argc - 1, argv + 1);
    std::fputs(kUsage, stderr);
    return 2;
}

} // namespace

OE_TOOL_COMMAND(request, "request", "statement --account ID (--bank-id ID --type TYPE | --cc) [...]",
                "build a complete statement request file (headers, sign-on, statement request)", Run);
