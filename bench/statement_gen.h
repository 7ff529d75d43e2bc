// Generator of large, realistic bank statement responses for the benchmarks: a header block, a
// sign-on response and one statement whose transaction list grows until the text reaches the
// requested size. Deterministic (fixed seed), SGML form (no element end tags) or XML-like form.
#ifndef OESDK_BENCH_STATEMENT_GEN_H
#define OESDK_BENCH_STATEMENT_GEN_H

#include <cstdint>
#include <cstdio>
#include <string>

namespace oesdk_bench {

enum class OFXForm { SGML, XML };

class StatementGenerator {
public:
    explicit StatementGenerator(OFXForm form, std::uint32_t seed = 12345) : m_form(form), m_state(seed) {}

    // A complete document of at least `targetBytes` bytes.
    std::string Generate(std::size_t targetBytes) {
        std::string out;
        out.reserve(targetBytes + 4096);
        if (m_form == OFXForm::SGML)
            out += "OFXHEADER:100\r\nDATA:OFXSGML\r\nVERSION:102\r\nSECURITY:NONE\r\nENCODING:USASCII\r\n"
                   "CHARSET:1252\r\nCOMPRESSION:NONE\r\nOLDFILEUID:NONE\r\nNEWFILEUID:NONE\r\n\r\n";
        else
            out += "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"no\"?>\n"
                   "<?OFX OFXHEADER=\"200\" VERSION=\"211\" SECURITY=\"NONE\" OLDFILEUID=\"NONE\" "
                   "NEWFILEUID=\"NONE\"?>\n";
        Open(out, "OFX");
        Open(out, "SIGNONMSGSRSV1");
        Open(out, "SONRS");
        Status(out);
        Element(out, "DTSERVER", "20240105120000.000[-5:EST]");
        Element(out, "LANGUAGE", "ENG");
        Close(out, "SONRS");
        Close(out, "SIGNONMSGSRSV1");
        Open(out, "BANKMSGSRSV1");
        Open(out, "STMTTRNRS");
        Element(out, "TRNUID", "1001");
        Status(out);
        Open(out, "STMTRS");
        Element(out, "CURDEF", "USD");
        Open(out, "BANKACCTFROM");
        Element(out, "BANKID", "121000248");
        Element(out, "ACCTID", "0123456789");
        Element(out, "ACCTTYPE", "CHECKING");
        Close(out, "BANKACCTFROM");
        Open(out, "BANKTRANLIST");
        Element(out, "DTSTART", "20230101");
        Element(out, "DTEND", "20240105");
        const std::string tail = Tail();
        for (unsigned n = 0; out.size() + tail.size() < targetBytes; ++n) Transaction(out, n);
        Close(out, "BANKTRANLIST");
        out += tail;
        return out;
    }

private:
    std::uint32_t Next() {
        m_state = m_state * 1664525u + 1013904223u;
        return m_state >> 8;
    }
    void Open(std::string& out, const char* tag) {
        out += '<';
        out += tag;
        out += ">\n";
    }
    void Close(std::string& out, const char* tag) {
        out += "</";
        out += tag;
        out += ">\n";
    }
    // A STATUS of code 0, severity INFO.
    void Status(std::string& out) {
        Open(out, "STATUS");
        Element(out, "CODE", "0");
        Element(out, "SEVERITY", "INFO");
        Close(out, "STATUS");
    }

    void Element(std::string& out, const char* tag, const std::string& value) {
        out += '<';
        out += tag;
        out += '>';
        out += value;
        if (m_form == OFXForm::XML) {
            out += "</";
            out += tag;
            out += '>';
        }
        out += '\n';
    }
    void Transaction(std::string& out, unsigned n) {
        static const char* const kTypes[] = {"DEBIT", "CREDIT", "POS", "ATM", "CHECK", "XFER", "FEE", "INT"};
        static const char* const kPayees[] = {"GROCERY OUTLET #1123",       "CITY WATER &amp; POWER",
                                              "PAYROLL ACME CORP",          "COFFEE HOUSE",
                                              "ONLINE TRANSFER TO SAVINGS", "RENT - MAIN ST APTS"};
        char buf[64];
        Open(out, "STMTTRN");
        const std::uint32_t r = Next();
        Element(out, "TRNTYPE", kTypes[r % 8]);
        std::snprintf(buf, sizeof buf, "2023%02u%02u120000", 1 + r % 12, 1 + (r >> 4) % 28);
        Element(out, "DTPOSTED", buf);
        std::snprintf(buf, sizeof buf, "%s%u.%02u", (r & 1) ? "-" : "", (r >> 5) % 5000, (r >> 9) % 100);
        Element(out, "TRNAMT", buf);
        std::snprintf(buf, sizeof buf, "2023%08u%06u", n, r % 1000000);
        Element(out, "FITID", buf);
        Element(out, "NAME", kPayees[(r >> 3) % 6]);
        if (r % 3 == 0)
            Element(out, "MEMO", "Reference 4471-" + std::to_string(r % 100000) + " card ****1234");
        Close(out, "STMTTRN");
    }
    void Balance(std::string& out, const char* tag, const char* amount) {
        Open(out, tag);
        Element(out, "BALAMT", amount);
        Element(out, "DTASOF", "20240105120000");
        Close(out, tag);
    }
    std::string Tail() {
        std::string t;
        Balance(t, "LEDGERBAL", "2517.42");
        Balance(t, "AVAILBAL", "2017.42");
        Close(t, "STMTRS");
        Close(t, "STMTTRNRS");
        Close(t, "BANKMSGSRSV1");
        Close(t, "OFX");
        return t;
    }

    OFXForm m_form;
    std::uint32_t m_state;
};

} // namespace oesdk_bench

#endif
