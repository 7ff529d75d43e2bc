// oesdk transactions FILE [--format csv|json]: every transaction of every bank and credit-card
// statement in the file, one row each.
#include "command.h"
#include "support.h"

#include <cstdio>
#include <cstring>

namespace {

struct Row {
    std::string account, kind, posted, type, amount, fitid, name, memo, checknum;
};

std::string Text(const OEString* s) {
    return s ? s->c_str() : "";
}

void CollectStatement(OEDataObj* object, std::vector<Row>& rows) {
    OEBankTransactionList* list = nullptr;
    std::string account, kind;
    if (OEBankStatementRs* bank = dynamic_cast<OEBankStatementRs*>(object)) {
        list = bank->GetTransactionList();
        if (OEBankAccount* a = bank->GetAccountFrom()) account = Text(a->GetAcctId());
        kind = "bank";
    } else if (OECCStatementRs* cc = dynamic_cast<OECCStatementRs*>(object)) {
        list = cc->GetTransactionList();
        if (OECCAccount* a = cc->GetAccountFrom()) account = Text(a->GetAcctId());
        kind = "creditcard";
    } else {
        return;
    }
    if (!list) return;
    for (unsigned short i = 0; i < list->GetNumStatementTx(); ++i) {
        OEBankStatementTx* tx = list->GetStatementTx(i);
        if (!tx) continue;
        Row r;
        r.account = account;
        r.kind = kind;
        r.posted = DateText(tx->GetDateTimePosted());
        r.type = tx->GetTxTypeText() ? tx->GetTxTypeText() : "";
        if (const OEPrecisionInteger* amount = tx->GetTxAmount()) {
            OEString text;
            OEAggregate::AmountText(*amount, text);
            r.amount = text.c_str();
        }
        r.fitid = Text(tx->GetFITId());
        r.name = Text(tx->GetName());
        if (r.name.empty() && tx->GetPayee()) r.name = Text(tx->GetPayee()->GetName());
        r.memo = Text(tx->GetMemo());
        if (r.memo.empty()) r.memo = Text(tx->GetMemo2());
        r.checknum = Text(tx->GetCheckNum());
        rows.push_back(r);
    }
}

std::string Csv(const std::string& v) {
    if (v.find_first_of(",\"\r\n") == std::string::npos) return v;
    std::string out = "\"";
    for (char c : v) {
        if (c == '"') out += '"';
        out += c;
    }
    return out + "\"";
}

std::string Json(const std::string& v) {
    std::string out = "\"";
    for (unsigned char c : v) {
        switch (c) {
        case '"':
            out += "\\\"";
            break;
        case '\\':
            out += "\\\\";
            break;
        case '\n':
            out += "\\n";
            break;
        case '\r':
            out += "\\r";
            break;
        case '\t':
            out += "\\t";
            break;
        default:
            if (c < 0x20) {
                char esc[8];
                std::snprintf(esc, sizeof(esc), "\\u%04x", c);
                out += esc;
            } else {
                out += static_cast<char>(c);
            }
        }
    }
    return out + "\"";
}

int Run(int argc, char** argv) {
    const char* path = nullptr;
    std::string format = "csv";
    for (int i = 0; i < argc; ++i) {
        if (std::strcmp(argv[i], "--format") == 0 && i + 1 < argc) {
            format = argv[++i];
        } else if (std::strncmp(argv[i], "--format=", 9) == 0) {
            format = argv[i] + 9;
        } else if (!path && argv[i][0] != '-') {
            path = argv[i];
        } else {
            path = nullptr;
            break;
        }
    }
    if (!path || (format != "csv" && format != "json")) {
        std::fprintf(stderr, "usage: oesdk transactions FILE [--format csv|json]\n");
        return 2;
    }
    Document doc;
    std::string error;
    if (!LoadDocument(path, false, doc, error)) {
        std::fprintf(stderr, "oesdk transactions: %s\n", error.c_str());
        return 3;
    }
    std::vector<Row> rows;
    WalkTree(doc.file.get(), 0, [&](OEDataObj* object, int) { CollectStatement(object, rows); });
    if (format == "csv") {
        std::printf("account,statement,date_posted,type,amount,fitid,name,memo,checknum\n");
        for (const Row& r : rows)
            std::printf("%s,%s,%s,%s,%s,%s,%s,%s,%s\n", Csv(r.account).c_str(), r.kind.c_str(),
                        r.posted.c_str(), r.type.c_str(), r.amount.c_str(), Csv(r.fitid).c_str(),
                        Csv(r.name).c_str(), Csv(r.memo).c_str(), Csv(r.checknum).c_str());
    } else {
        std::printf("[");
        for (size_t i = 0; i < rows.size(); ++i) {
            const Row& r = rows[i];
            std::printf("%s\n  {\"account\": %s, \"statement\": %s, \"date_posted\": %s, \"type\": %s, "
                        "\"amount\": %s, "
                        "\"fitid\": %s, \"name\": %s, \"memo\": %s, \"checknum\": %s}",
                        i ? "," : "", Json(r.account).c_str(), Json(r.kind).c_str(), Json(r.posted).c_str(),
                        Json(r.type).c_str(), Json(r.amount).c_str(), Json(r.fitid).c_str(),
                        Json(r.name).c_str(), Json(r.memo).c_str(), Json(r.checknum).c_str());
        }
        std::printf("%s]\n", rows.empty() ? "" : "\n");
    }
    return doc.status == OEPS_OK || doc.status == OEPS_WARNINGS ? 0 : 1;
}

} // namespace

OE_TOOL_COMMAND(transactions, "transactions", "FILE [--format csv|json]",
                "list every bank and credit-card statement transaction (amounts exactly as written)", Run);
