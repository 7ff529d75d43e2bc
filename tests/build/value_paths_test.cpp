// The builder writes the library's own numbers and dates from their formatting functions straight
// into the block, and every other class through its virtual conversion; tags and values go in
// place when the block has room and through the buffer's growing writes when it has not. Both
// choices must be invisible in the text.
#include "build_helpers.h"

#include <gtest/gtest.h>

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

TEST(BuilderValuePaths, NumbersOfEveryClassKeepTheirTextForm) {
    Bound b;
    OEPrecisionInteger amount("-1234.500");
    OEPosPrecisionInteger price("0.0625");
    OEPercent rate("12.50");
    Bracketed host("77.10");
    OEPayrollAmount empty(OEPAT_EMPTY), money("$12.5");
    // Above 64 bits: 1234567890123456789 x 1000003 with scale 4.
    const OEPrecisionInteger wide =
        OEPrecisionInteger(1234567890123456789ull, 0) * OEPrecisionInteger(1000003ull, 4);
    EXPECT_EQ(b.builder.AddAmount(amount), OEBS_OK);
    EXPECT_EQ(b.builder.AddUnitPrice(price), OEBS_OK);
    EXPECT_EQ(b.builder.AddRate(rate), OEBS_OK);
    EXPECT_EQ(b.builder.AddQuantity(host), OEBS_OK);
    EXPECT_EQ(b.builder.AddAmount(empty), OEBS_OK);
    EXPECT_EQ(b.builder.AddAmount(money), OEBS_OK);
    EXPECT_EQ(b.builder.AddAmount(wide), OEBS_OK);
    std::string expected = std::string("-1234.5\n.0625\n12.5\n#7.1\n") + static_cast<char*>(empty) + "\n" +
                           static_cast<char*>(money) + "\n123457159382712715937.0367\n";
    EXPECT_EQ(b.text(), expected);
    OEPercent tooMuch("100.01");
    EXPECT_EQ(b.builder.AddRate(tooMuch), OEBS_NOTEXTFORM);
    EXPECT_EQ(b.text(), expected) << "an invalid number writes nothing";
}

TEST(BuilderValuePaths, DatesOfEveryClassKeepTheirTextForm) {
    Bound b;
    OEDateTime plain("20240131235959.999[-3.5:NST]"), midnight("20240229");
    OEDateTime invalid(2023, 2, 29, 0, 0, 0, 0, 0, 0);
    Stamped host("20240101");
    OEPayrollDateTime payrollEmpty, payroll;
    payrollEmpty.Assign("^@~*");
    payroll.Assign("20240102");
    EXPECT_EQ(b.builder.AddDateTime(plain), OEBS_OK);
    EXPECT_EQ(b.builder.AddDateTime(midnight), OEBS_OK);
    EXPECT_EQ(b.builder.AddDateTime(invalid), OEBS_NOTEXTFORM);
    EXPECT_EQ(b.builder.AddDateTime(host), OEBS_OK);
    EXPECT_EQ(b.builder.AddDateTime(payrollEmpty), OEBS_OK);
    EXPECT_EQ(b.builder.AddDateTime(payroll), OEBS_OK);
    EXPECT_EQ(b.text(), "20240131235959.999[-3.50:NST]\n20240229\nSTAMP\n^@~*\n20240102\n");
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
