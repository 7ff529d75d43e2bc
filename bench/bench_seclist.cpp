// The security list: a generated SECLIST of 10,000 descriptions (the five kinds in turn, funds with
// an asset mix), parsed to a typed tree (MB/s of input) and built back to text (MB/s of output).
//
//   ./build-rel/bench_seclist --benchmark_min_time=1
#include "parse_build.h"

#include <memory>
#include <string>

namespace {

const int kSecurities = 10000;

std::string SecInfo(int i) {
    std::string n = std::to_string(i);
    return "<SECINFO><SECID><UNIQUEID>" + n + "<UNIQUEIDTYPE>CUSIP</SECID><SECNAME>Security number " + n +
           "<TICKER>T" + n + "<UNITPRICE>" + std::to_string(10 + i % 90) +
           ".25<DTASOF>20240105120000</SECINFO>";
}

const std::string& Document() {
    static std::string doc;
    if (!doc.empty()) return doc;
    doc = "OFXHEADER:100\r\nDATA:OFXSGML\r\nVERSION:102\r\n\r\n<OFX><SIGNONMSGSRSV1><SONRS><STATUS><CODE>0"
          "<SEVERITY>INFO</STATUS><DTSERVER>20240105<LANGUAGE>ENG</SONRS></SIGNONMSGSRSV1>"
          "<SECLISTMSGSRSV1><SECLIST>";
    for (int i = 0; i < kSecurities; ++i) {
        switch (i % 5) {
        case 0:
            doc +=
                "<STOCKINFO>" + SecInfo(i) + "<STOCKTYPE>COMMON<YIELD>1.5<ASSETCLASS>LARGESTOCK</STOCKINFO>";
            break;
        case 1:
            doc += "<MFINFO>" + SecInfo(i) +
                   "<MFTYPE>OPENEND<MFASSETCLASS><PORTION><ASSETCLASS>INTLBOND"
                   "<PERCENT>40</PORTION><PORTION><ASSETCLASS>SMALLSTOCK<PERCENT>60"
                   "</PORTION></MFASSETCLASS></MFINFO>";
            break;
        case 2:
            doc += "<DEBTINFO>" + SecInfo(i) +
                   "<PARVALUE>1000<DEBTTYPE>COUPON<COUPONRT>4.25<COUPONFREQ>"
                   "SEMIANNUAL<DTMAT>20340115</DEBTINFO>";
            break;
        case 3:
            doc += "<OPTINFO>" + SecInfo(i) +
                   "<OPTTYPE>CALL<STRIKEPRICE>35<DTEXPIRE>20250117<SHPERCTRCT>100"
                   "</OPTINFO>";
            break;
        default:
            doc += "<OTHERINFO>" + SecInfo(i) + "<TYPEDESC>Annuity</OTHERINFO>";
        }
    }
    doc += "</SECLIST></SECLISTMSGSRSV1></OFX>";
    return doc;
}

const benchutil::Attached attached;

std::unique_ptr<OEFileRs> NewRoot() {
    return std::unique_ptr<OEFileRs>(OEDataObj::GetFactory()->NewFileRs(0));
}

void SecListParse(benchmark::State& state) {
    benchutil::ParseLoop(state, Document(), NewRoot);
}
BENCHMARK(SecListParse)->Unit(benchmark::kMillisecond);

void SecListBuild(benchmark::State& state) {
    benchutil::BuildLoop(state, Document(), NewRoot);
}
BENCHMARK(SecListBuild)->Unit(benchmark::kMillisecond);

} // namespace

BENCHMARK_MAIN();
