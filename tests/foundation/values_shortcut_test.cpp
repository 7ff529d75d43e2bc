// White-box: the one-pass readers of the common date-time, time and decimal shapes against the
// general readers they stand in for. Every text, generated or picked by hand, valid or not, must
// give the same result, the same stored fields and the same logged warnings either way.
#include "alloc_failure.h"
#include "values_testlog.h"

#include <cstring>
#include <memory>
#include <random>
#include <sstream>
#include <string>
#include <vector>

namespace {

// The general readers, reachable through the classes' protected interface.
struct GeneralDateTime : OEDateTime {
    unsigned short Parse(const char* text) { return ParseDateTimeText(text); }
    unsigned short ParseTime(const char* text) { return ParseTimeText(text); }
};

struct GeneralDecimal : OEPrecisionInteger {
    unsigned short Parse(const char* text) { return ParseText(text, text + std::strlen(text), text); }
};

// The warnings logged since the last look, as text.
std::string Warnings(ScopedWarningLog& log) {
    std::ostringstream out;
    for (const RecordedWarning& w : log.Entries())
        out << " {" << w.code << " '" << w.text << "' " << w.context << "}";
    log.Clear();
    return out.str();
}

// Everything a caller can see after a conversion, as one comparable text.
std::string Observe(unsigned short result, const OEDateTimeBase& d, ScopedWarningLog& log) {
    std::ostringstream out;
    out << result << " | " << d.GetYear() << '-' << d.GetMonth() << '-' << d.GetDay() << ' ' << d.GetHour()
        << ':' << d.GetMinute() << ':' << d.GetSecond() << '.' << d.GetMillisecond() << " ["
        << d.GetTimeZoneHours() << ',' << d.GetTimeZoneFraction() << ",'" << d.GetTimeZone().c_str() << "'/"
        << d.GetTimeZone().GetStrLength() << '/' << d.GetTimeZone().BufferSize() << "] valid "
        << d.IsValidDate() << d.IsValidTime() << " |" << Warnings(log);
    return out.str();
}

std::string Observe(unsigned short result, const OEPrecisionInteger& n, ScopedWarningLog& log) {
    std::ostringstream out;
    out << result << " | " << n.GetMSBytes() << ' ' << n.GetSSBytes() << ' ' << n.GetLSBytes() << " sign "
        << n.Sign() << " scale " << n.Decimal() << " valid " << n.IsValid() << " |" << Warnings(log);
    return out.str();
}

// Every text made of one choice from each part, in order.
std::vector<std::string> Combine(const std::vector<std::vector<std::string>>& parts) {
    std::vector<std::string> out{""};
    for (const auto& choices : parts) {
        std::vector<std::string> next;
        for (const std::string& head : out)
            for (const std::string& tail : choices) next.push_back(head + tail);
        out.swap(next);
    }
    return out;
}

// Adds `count` of the texts again, each with one character replaced or cut short there.
void AddMutations(std::vector<std::string>& texts, const char* alphabet, unsigned count) {
    std::mt19937 rng(20240229);
    const std::size_t base = texts.size();
    const std::size_t letters = std::strlen(alphabet);
    for (unsigned i = 0; i < count; ++i) {
        std::string t = texts[rng() % base];
        if (t.empty()) continue;
        const std::size_t at = rng() % t.size();
        if (rng() % 4 == 0)
            t.resize(at);
        else
            t[at] = alphabet[rng() % letters];
        texts.push_back(t);
    }
}

// The text in a block of exactly its size, so that a sanitizer sees any read past its end.
std::unique_ptr<char[]> Exact(const std::string& text) {
    std::unique_ptr<char[]> copy(new char[text.size() + 1]);
    std::memcpy(copy.get(), text.c_str(), text.size() + 1);
    return copy;
}

const char* const kEarlier = "19991231235959.999[-5:EST]";

class ValuesShortcut : public ::testing::Test {
protected:
    ScopedWarningLog log;
};

TEST_F(ValuesShortcut, DateTimesMatchTheGeneralReader) {
    // Dates and times with every kind of time part, then a few of them with every kind of zone.
    std::vector<std::string> texts = Combine({
        {"20240131", "20240229", "20230229", "21000229", "20000229", "00000229", "19991231", "20240431",
         "20241301", "20240001", "20240100", "2024013", "2024a131", "", "2024-01-31"},
        {"", "1", "12", "123", "1234", "123456", "000000", "235959", "240000", "126000", "120060", "12345",
         "1234567", "12:30"},
        {"", ".", ".5", ".05", ".999", ".1234", ".x"},
    });
    const std::vector<std::string> zoned = Combine({
        {"20240131", "20230229", "2024013112", "20240131120000", "20240131120000.5", "20240131240000",
         "2024013112.5"},
        {"",        "[",     "[]",     "[-5:EST]", "[-5:PST]",   "[-4:EDT]", "[-8:YDT]", "[+3]",
         "[0:GMT]", "[5.5]", "[-3.5]", "[-0.5]",   "[5.45:IST]", "[5.555]",  "[--5]",    "[5-]",
         "[13]",    "[-12]", "[+12]",  "[-13]",    "[-5:ESTX]",  "[-5:EST",  "[-5]x",    "[:EST]",
         "[-:EST]", "[5.]",  "[005]",  "[-5:]",    "[-5:E]]",    "[-5:[]",   "[5.5.]",   "[5x]"},
    });
    texts.insert(texts.end(), zoned.begin(), zoned.end());
    for (const char* more :
         {"20240131120000:00", "20240131-0500", " 20240131", "20240131 ", "20240131\t120000"})
        texts.push_back(more);
    AddMutations(texts, "0123456789.[]:+-E x", 4000);

    for (const std::string& each : texts) {
        SCOPED_TRACE("\"" + each + "\"");
        const std::unique_ptr<char[]> exact = Exact(each);
        const char* const text = exact.get();
        const char* const time = text + (each.size() >= 8 ? 8 : 0);
        for (bool fresh : {true, false}) {
            OEDateTime shortcut;
            GeneralDateTime general;
            if (!fresh) {
                shortcut.ConvertStringToOEDateTime(kEarlier);
                general.Parse(kEarlier);
            }
            log.Clear();
            const std::string viaShortcut = Observe(shortcut.ConvertStringToOEDateTime(text), shortcut, log);
            const std::string viaGeneral = Observe(general.Parse(text), general, log);
            ASSERT_EQ(viaGeneral, viaShortcut);
        }
        // A text that is a time alone.
        OETime shortcut;
        GeneralDateTime general;
        const std::string viaShortcut = Observe(shortcut.ConvertStringToOETime(time), shortcut, log);
        const std::string viaGeneral = Observe(general.ParseTime(time), general, log);
        ASSERT_EQ(viaGeneral, viaShortcut);
    }
}

TEST_F(ValuesShortcut, ZoneNameWithoutMemory) {
    const struct {
        const char* text;
        bool timeOnly;
    } cases[] = {
        {"20240131120000.000[-5:EST]", false}, {"20240131[-5:PST]", false}, {"120000[-5:EST]", true}};
    for (const auto& c : cases) {
        SCOPED_TRACE(c.text);
        std::string viaShortcut, viaGeneral;
        {
            OEDateTime shortcut;
            FailAllocations noMemory;
            viaShortcut = Observe(c.timeOnly ? shortcut.ConvertStringToOETime(c.text)
                                             : shortcut.ConvertStringToOEDateTime(c.text),
                                  shortcut, log);
        }
        {
            GeneralDateTime general;
            FailAllocations noMemory;
            viaGeneral =
                Observe(c.timeOnly ? general.ParseTime(c.text) : general.Parse(c.text), general, log);
        }
        EXPECT_EQ(viaGeneral, viaShortcut);
        EXPECT_EQ('0', viaShortcut[0]); // the name could not be stored: the conversion fails
    }
}

// A time read from the object's own zone name: clearing the fields first changes that text.
TEST_F(ValuesShortcut, TextInsideTheObject) {
    OETime shortcut;
    GeneralDateTime general;
    shortcut.SetTimeZone("12", 0, 0);
    general.SetTimeZone("12", 0, 0);
    const std::string viaShortcut =
        Observe(shortcut.ConvertStringToOETime(shortcut.GetTimeZone().c_str()), shortcut, log);
    const std::string viaGeneral = Observe(general.ParseTime(general.GetTimeZone().c_str()), general, log);
    EXPECT_EQ(viaGeneral, viaShortcut);
}

TEST_F(ValuesShortcut, DecimalsMatchTheGeneralReader) {
    std::vector<std::string> texts = Combine({
        {"", "-", "+", "--", "+-", " ", "$"},
        {"", "0", "5", "007", "1,234", ",", "1,,2", ",5", "123456789012345678", "1234567890123456789",
         "12345678901234567890", "18446744073709551615", "18446744073709551616",
         "1234567890123456789012345678", "12345678901234567890123456789", "99999999999999999999999999999999"},
        {"", ".", ".5", ".50", ".1,2", "..5", ".5.", ".000000000000000000000000000", ".1234567890123456789",
         ".123456789012345678901234567890", ".x"},
        {"", " ", "+", "-", "x", "%"},
    });
    AddMutations(texts, "0123456789,.-+ x", 3000);

    for (const std::string& each : texts) {
        SCOPED_TRACE("\"" + each + "\"");
        const std::unique_ptr<char[]> exact = Exact(each);
        const char* const text = exact.get();
        OEPrecisionInteger shortcut("-987.654");
        GeneralDecimal general;
        general.Parse("-987.654");
        log.Clear();
        const std::string viaShortcut =
            Observe(shortcut.ConvertStringToOEPrecisionInteger(text), shortcut, log);
        const std::string viaGeneral = Observe(general.Parse(text), general, log);
        ASSERT_EQ(viaGeneral, viaShortcut);
    }
}

} // namespace
