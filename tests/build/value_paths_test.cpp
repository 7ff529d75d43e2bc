// The builder writes the library's own numbers and dates from their formatting functions straight
// into the block, and every other class through its virtual conversion; tags and values go in
// place when the block has room and through the buffer's growing writes when it has not. Both
// choices must be invisible in the text.
#include "build_helpers.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>

namespace {

using namespace buildtest;

// A host's number and date that change their text form.
class Bracketed : public OEPrecisionInteger {
public:
    using OEPrecisionInteger::OEPrecisionInteger;
    operator char*() override {
        char* text = OEPrecisionInteger::operator char*();
        if (text) text[0] = '#';
        return text;
    }
};
class Stamped : public OEDateTime {
public:
    using OEDateTime::OEDateTime;
    unsigned short GetDateString(OEString& out) const override { return out.Assign("STAMP", 5); }
};

TEST(BuilderValuePaths, NumbersAndDatesOfEveryClassKeepTheirTextForm) {
    OEPrecisionInteger amount("-1234.500");
    OEPosPrecisionInteger price("0.0625");
    OEPercent rate("12.50"), tooMuch("100.01");
    Bracketed host("77.10");
    OEPayrollAmount empty(OEPAT_EMPTY), money("$12.5");
    // Above 64 bits: 1234567890123456789 x 1000003 with scale 4.
    const OEPrecisionInteger wide =
        OEPrecisionInteger(1234567890123456789ull, 0) * OEPrecisionInteger(1000003ull, 4);
    OEDateTime plain("20240131235959.999[-3.5:NST]"), midnight("20240229");
    OEDateTime invalid(2023, 2, 29, 0, 0, 0, 0, 0, 0);
    Stamped stamped("20240101");
    OEDateTime longName(2024, 1, 31, 0, 0, 0, 0, 2, 0);
    longName.SetTimeZone(std::string(200, 'Z').c_str(), 2, 0); // kept as given, written cut to three
    OEPayrollDateTime payrollEmpty, payroll;
    payrollEmpty.Assign("^@~*");
    payroll.Assign("20240102");
    const struct {
        std::function<int(OEBuilder&)> write;
        int status;
        std::string text; // written, with its line end
    } cases[] = {
        {[&](OEBuilder& b) { return b.AddAmount(amount); }, OEBS_OK, "-1234.5\n"},
        {[&](OEBuilder& b) { return b.AddUnitPrice(price); }, OEBS_OK, ".0625\n"},
        {[&](OEBuilder& b) { return b.AddRate(rate); }, OEBS_OK, "12.5\n"},
        {[&](OEBuilder& b) { return b.AddRate(tooMuch); }, OEBS_NOTEXTFORM, ""},
        {[&](OEBuilder& b) { return b.AddQuantity(host); }, OEBS_OK, "#7.1\n"},
        {[&](OEBuilder& b) { return b.AddAmount(empty); }, OEBS_OK,
         std::string(static_cast<char*>(empty)) + "\n"},
        {[&](OEBuilder& b) { return b.AddAmount(money); }, OEBS_OK,
         std::string(static_cast<char*>(money)) + "\n"},
        {[&](OEBuilder& b) { return b.AddAmount(wide); }, OEBS_OK, "123457159382712715937.0367\n"},
        {[&](OEBuilder& b) { return b.AddDateTime(plain); }, OEBS_OK, "20240131235959.999[-3.50:NST]\n"},
        {[&](OEBuilder& b) { return b.AddDateTime(midnight); }, OEBS_OK, "20240229\n"},
        {[&](OEBuilder& b) { return b.AddDateTime(longName); }, OEBS_OK, "20240131000000.000[2:ZZZ]\n"},
        {[&](OEBuilder& b) { return b.AddDateTime(invalid); }, OEBS_NOTEXTFORM, ""},
        {[&](OEBuilder& b) { return b.AddDateTime(stamped); }, OEBS_OK, "STAMP\n"},
        {[&](OEBuilder& b) { return b.AddDateTime(payrollEmpty); }, OEBS_OK, "^@~*\n"},
        {[&](OEBuilder& b) { return b.AddDateTime(payroll); }, OEBS_OK, "20240102\n"},
    };
    for (const auto& c : cases) {
        Bound b;
        EXPECT_EQ(c.write(b.builder), c.status) << c.text;
        EXPECT_EQ(b.text(), c.text);
    }
}

// The same elements written into blocks from empty to roomy, growing one byte at a time or in
// large steps: the text never depends on where a write found room.
TEST(BuilderValuePaths, TextDoesNotDependOnTheRoomInTheBlock) {
    auto write = [&](OEBuilder& builder) {
        OEPrecisionInteger amount("-25.05");
        OEDateTime date("20240131120000[-5:EST]");
        builder.AddTagStart(OETAG_STMTTRN);
        builder.AddTagOEDateTime(OETAG_DTPOSTED, date);
        builder.AddTagOEAmount(OETAG_TRNAMT, amount);
        builder.AddTagOEString(OETAG_NAME, OEString("A&B <C>"));
        builder.AddTagOEString(OETAG_MEMO, OEString("plain memo text of some length"));
        builder.AddBankTxType(OEBTT_ATM);
        builder.AddTagOEKeyword(OETAG_SEVERITY, "INFO");
        builder.AddTagEnd(OETAG_STMTTRN);
    };
    for (unsigned short endTags = 0; endTags < 2; ++endTags) {
        BoundTo<OEBuilder> roomy(OEBCL_CRLF, endTags);
        write(roomy.builder);
        const std::string expected = roomy.text();
        ASSERT_NE(expected.find("<NAME>A&amp;B &lt;C&gt;\n"), std::string::npos) << expected;
        for (unsigned long allocation = 0; allocation < 96; ++allocation) {
            for (unsigned long growBy : {1ul, 7ul, 4096ul}) {
                OEBuffer buffer(allocation, growBy);
                Probe root;
                OEBuilder builder(OEBCL_CRLF, endTags);
                builder.Build(&buffer, &root, OEBSO_STRICT, 0, 0);
                write(builder);
                ASSERT_EQ(Text(buffer), expected) << allocation << " / " << growBy;
            }
        }
    }
}

} // namespace
