#include "foundation/oepayrollamount.h"

#include <cstring>

namespace {
const char kEmptyMarker[] = "^@~*";
const char kEmptyMarkerLong[] = "__OFX_EMPTY_STRING__";
const std::size_t kMaxForm = 30; // the payroll text form never exceeds 30 characters
} // namespace

OEPayrollAmount::OEPayrollAmount() : m_percent(0), m_empty(0), m_money(0), m_dollar(0) {}

OEPayrollAmount::OEPayrollAmount(const OEPayrollAmount& other)
    : OEPrecisionInteger(other), m_percent(other.m_percent), m_empty(other.m_empty), m_money(other.m_money),
      m_dollar(other.m_dollar) {}

OEPayrollAmount::OEPayrollAmount(const OEPrecisionInteger& value, unsigned short percent,
                                 unsigned short money)
    : OEPrecisionInteger(value), m_percent(percent ? 1 : 0), m_empty(0), m_money(money ? 1 : 0), m_dollar(0) {
}

OEPayrollAmount::OEPayrollAmount(long long raw, unsigned short scale, unsigned short percent)
    : OEPrecisionInteger(raw, scale), m_percent(percent ? 1 : 0), m_empty(0), m_money(0), m_dollar(0) {}

OEPayrollAmount::OEPayrollAmount(const char* text) : OEPayrollAmount() {
    Assign(text);
}

OEPayrollAmount::OEPayrollAmount(OEPayrollAmountType type) : OEPayrollAmount() {
    if (type == OEPAT_EMPTY) {
        m_empty = 1;
    } else {
        m_money = 1;
        SetDecimal(2);
    }
}

OEPayrollAmount& OEPayrollAmount::operator=(const OEPayrollAmount& other) {
    OEPrecisionInteger::operator=(other);
    m_percent = other.m_percent;
    m_empty = other.m_empty;
    m_money = other.m_money;
    m_dollar = other.m_dollar;
    return *this;
}

OEPayrollAmount& OEPayrollAmount::operator=(const char* text) {
    Assign(text);
    return *this;
}

unsigned short OEPayrollAmount::Assign(const char* text) {
    if (text && (std::strcmp(text, kEmptyMarker) == 0 || std::strcmp(text, kEmptyMarkerLong) == 0)) {
        m_empty = 1;
        return 1;
    }
    m_empty = 0;
    if (!text) return ConvertStringToOEPrecisionInteger(text);
    const char* begin = text;
    const char* end = text + std::strlen(text);
    // A '$' right at the start or after the sign is not part of the number.
    const std::size_t signLen = (*begin == '-' || *begin == '+') ? 1 : 0;
    const bool dollar = static_cast<std::size_t>(end - begin) > signLen && begin[signLen] == '$';
    const bool percent = end > begin && end[-1] == '%';
    if (percent) --end;
    unsigned short ok;
    if (dollar) {
        // The sign stays first: parse "<sign><rest>" without the '$'.
        char small[64];
        const std::size_t restLen = static_cast<std::size_t>(end - begin) - signLen - 1;
        if (signLen + restLen < sizeof small) {
            std::memcpy(small, begin, signLen);
            std::memcpy(small + signLen, begin + signLen + 1, restLen);
            ok = ParseText(small, small + signLen + restLen, text);
        } else {
            ok = ParseText(begin, end, text); // far too long for a number anyway: logged there
        }
    } else {
        ok = ParseText(begin, end, text);
    }
    if (ok) {
        if (dollar) m_money = m_dollar = 1;
        if (percent) m_percent = 1;
    }
    return ok;
}

// Rules of the payroll text form:
// 1. An empty amount is "^@~*".
// 2. Otherwise the number's text; a trailing '.' is dropped and a leading '.' (after any sign)
//    gets a '0' in front.
// 3. Money: with the dollar option a '$' goes after the sign (a text of 30 characters or more at
//    that point becomes empty); then one decimal gets a '0' appended (while shorter than 29) and
//    none gets ".00" (while shorter than 28).
// 4. Percent: a '%' is appended; a text already 30 characters long or more drops a leading '0'
//    digit and puts the '%' at position 29, or becomes empty when it has no such zero.
// A form that would still not fit the 30 characters becomes empty.
OEPayrollAmount::operator char*() {
    char* buf = TextBuffer();
    if (!buf) return nullptr;
    if (m_empty) {
        std::memcpy(buf, kEmptyMarker, sizeof kEmptyMarker);
        return buf;
    }
    const char* number = OEPrecisionInteger::operator char*();
    if (!number) return nullptr;
    char t[80];
    std::size_t len = std::strlen(number);
    std::memcpy(t, number, len + 1);
    if (len && t[len - 1] == '.') t[--len] = '\0';
    const std::size_t s = t[0] == '-' ? 1 : 0;
    if (t[s] == '.') {
        std::memmove(t + s + 1, t + s, len - s + 1);
        t[s] = '0';
        ++len;
    }
    auto makeEmpty = [&]() {
        buf[0] = '\0';
        return buf;
    };
    if (m_money) {
        if (m_dollar) {
            std::memmove(t + s + 1, t + s, len - s + 1);
            t[s] = '$';
            ++len;
            if (len >= kMaxForm) return makeEmpty();
        }
        const char* point = std::strchr(t, '.');
        if (!point) {
            if (len < 28) {
                std::memcpy(t + len, ".00", 4);
                len += 3;
            }
        } else if (len - static_cast<std::size_t>(point - t) - 1 == 1 && len < 29) {
            t[len++] = '0';
            t[len] = '\0';
        }
    }
    if (m_percent) {
        if (len >= kMaxForm) {
            if (t[s] != '0') return makeEmpty();
            std::memmove(t + s, t + s + 1, len - s);
            --len;
            t[29] = '%';
            t[30] = '\0';
            len = 30;
        } else {
            t[len++] = '%';
            t[len] = '\0';
        }
    }
    if (len > kMaxForm) return makeEmpty();
    std::memcpy(buf, t, len + 1);
    return buf;
}

unsigned short OEPayrollAmount::operator==(const OEPrecisionInteger& other) const {
    const OEPayrollAmount* p = dynamic_cast<const OEPayrollAmount*>(&other);
    const unsigned short otherEmpty = p ? p->m_empty : 0;
    const unsigned short otherPercent = p ? p->m_percent : 0;
    const unsigned short otherMoney = p ? p->m_money : 0;
    if (m_empty || otherEmpty) return 0;
    if (m_percent != otherPercent || m_money != otherMoney) return 0;
    return OEPrecisionInteger::operator==(other);
}

unsigned short OEPayrollAmount::operator!=(const OEPrecisionInteger& other) const {
    return operator==(other) ? 0 : 1;
}
