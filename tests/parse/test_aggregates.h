// Small aggregate classes for the parser tests: one table-driven class stands in for the real
// aggregates (which arrive with the message sets). Each test tag has its valid rows, required rows
// and the subset of rows that are child aggregates.
#ifndef OESDK_TESTS_PARSE_TEST_AGGREGATES_H
#define OESDK_TESTS_PARSE_TEST_AGGREGATES_H

#include "oesdk.h"

#include <map>
#include <memory>
#include <set>
#include <string>
#include <vector>

namespace testagg {

struct Spec {
    std::vector<OETagRow> valid;
    std::vector<OETagRow> required;
    std::set<OETagID> aggregates;
    std::set<OETagID> repeatable; // aggregates that may occur more than once
};

inline OETagRow Row(OETagID tag, unsigned short mask = OEVM_ALL) {
    return OETagRow{tag, mask, 0};
}

inline const std::map<OETagID, Spec>& Specs() {
    static const std::map<OETagID, Spec> specs = {
        {OETAG_NONE, {{Row(OETAG_OFX)}, {}, {OETAG_OFX}, {}}},
        {OETAG_OFX,
         {{Row(OETAG_SIGNONMSGSRSV1), Row(OETAG_BANKMSGSRSV1)},
          {},
          {OETAG_SIGNONMSGSRSV1, OETAG_BANKMSGSRSV1},
          {}}},
        {OETAG_SIGNONMSGSRSV1, {{Row(OETAG_SONRS)}, {}, {OETAG_SONRS}, {}}},
        {OETAG_SONRS,
         {{Row(OETAG_STATUS), Row(OETAG_DTSERVER), Row(OETAG_USERPASS), Row(OETAG_LANGUAGE)},
          {Row(OETAG_STATUS), Row(OETAG_DTSERVER)},
          {OETAG_STATUS},
          {}}},
        {OETAG_STATUS,
         {{Row(OETAG_CODE), Row(OETAG_SEVERITY), Row(OETAG_MESSAGE)}, {Row(OETAG_CODE)}, {}, {}}},
        {OETAG_BANKMSGSRSV1, {{Row(OETAG_STMTTRNRS)}, {}, {OETAG_STMTTRNRS}, {OETAG_STMTTRNRS}}},
        {OETAG_STMTTRNRS,
         {{Row(OETAG_TRNUID), Row(OETAG_STATUS), Row(OETAG_STMTRS)},
          {Row(OETAG_TRNUID)},
          {OETAG_STATUS, OETAG_STMTRS},
          {}}},
        {OETAG_STMTRS,
         {{Row(OETAG_CURDEF), Row(OETAG_BANKTRANLIST), Row(OETAG_LEDGERBAL)},
          {Row(OETAG_CURDEF)},
          {OETAG_BANKTRANLIST, OETAG_LEDGERBAL},
          {}}},
        // BANKTRANLIST may nest in itself here, to test the depth limit.
        {OETAG_BANKTRANLIST,
         {{Row(OETAG_DTSTART), Row(OETAG_DTEND), Row(OETAG_STMTTRN), Row(OETAG_BANKTRANLIST)},
          {},
          {OETAG_STMTTRN, OETAG_BANKTRANLIST},
          {OETAG_STMTTRN}}},
        {OETAG_STMTTRN,
         {{Row(OETAG_TRNTYPE), Row(OETAG_DTPOSTED), Row(OETAG_TRNAMT), Row(OETAG_FITID), Row(OETAG_NAME),
           Row(OETAG_MEMO)},
          {Row(OETAG_FITID)},
          {},
          {}}},
        {OETAG_LEDGERBAL, {{Row(OETAG_BALAMT), Row(OETAG_DTASOF)}, {Row(OETAG_BALAMT)}, {}, {}}},
    };
    return specs;
}

// One aggregate. Elements are kept as text; the value "BAD" stands for one that does not convert.
class Agg : public OEDataObj {
public:
    explicit Agg(OETagID type, unsigned short version = 0) : OEDataObj(version) {
        SetType(type);
        auto it = Specs().find(type);
        m_spec = it == Specs().end() ? nullptr : &it->second;
    }

    unsigned short GetArrayOfValidTags(OEArrayOfTags& tags) const override {
        if (!m_spec) return OEDataObj::GetArrayOfValidTags(tags);
        tags.Set(m_spec->valid.data(), static_cast<unsigned short>(m_spec->valid.size()));
        return 1;
    }
    unsigned short GetArrayOfRequiredTags(OEArrayOfTags& tags) const override {
        if (!m_spec) return OEDataObj::GetArrayOfRequiredTags(tags);
        tags.Set(m_spec->required.data(), static_cast<unsigned short>(m_spec->required.size()));
        return 1;
    }

    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override {
        if (!m_spec || !m_spec->aggregates.count(entry->m_id)) return OEPS_INVALID;
        if (!GetFactory()) return OEPS_NORESOURCE;
        if (!m_spec->repeatable.count(entry->m_id)) {
            for (auto it = m_children.begin(); it != m_children.end(); ++it)
                if ((*it)->GetType() == entry->m_id) {
                    OELogParseWarning(OEPW_EXTRAAGG, entry->m_name, nullptr, entry->m_id, this);
                    m_children.erase(it);
                    break;
                }
        }
        m_children.emplace_back(new Agg(entry->m_id));
        return PushAndSetObject(m_children.back().get(), entry->m_id);
    }

    OEParseStatus HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) override {
        if (!m_spec || m_spec->aggregates.count(entry->m_id) || !IsValidTag(entry->m_id)) return OEPS_INVALID;
        if (value == "BAD") {
            OELogParseWarning(OEPW_BADFORMAT, entry->m_name, value.c_str(), entry->m_id, this);
            return OEPS_OK;
        }
        m_values[entry->m_id] = value.c_str();
        SetTag(entry->m_id);
        return OEPS_OK;
    }

    OEParseStatus HandleHeader(OEHeaderTag tag, const OEString& value, OEString* name) override {
        m_headers.push_back(std::to_string(static_cast<int>(tag)) + ":" + (name ? name->c_str() : "") + "=" +
                            value.c_str());
        return OEPS_OK;
    }

    OEDataObj* GetChild(unsigned short i) const override {
        return i < m_children.size() ? m_children[i].get() : nullptr;
    }
    unsigned short GetNumberOfChildren() const override {
        return static_cast<unsigned short>(m_children.size());
    }

    std::string Value(OETagID tag) const {
        auto it = m_values.find(tag);
        return it == m_values.end() ? std::string() : it->second;
    }
    const std::vector<std::string>& Headers() const { return m_headers; }

    // The whole subtree as one line: TAG{CHILD=value;AGG{...}}.
    std::string Dump() const {
        std::string s = Name(GetType()) + "{";
        for (const auto& v : m_values) s += Name(v.first) + "=" + v.second + ";";
        for (const auto& c : m_children) s += c->Dump();
        return s + "}";
    }

    static std::string Name(OETagID tag) {
        if (tag == OETAG_NONE) return "ROOT";
        return OETagDictionary::TheOETagDictionary()->GetTagString(tag);
    }

private:
    const Spec* m_spec;
    std::map<OETagID, std::string> m_values;
    std::vector<std::unique_ptr<Agg>> m_children;
    std::vector<std::string> m_headers;
};

// The log as lines "CODE text|aux tag" (offsets left out), for comparing runs.
inline std::vector<std::string> LogLines() {
    std::vector<std::string> lines;
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    for (unsigned short i = 0; log && i < log->GetNumberParseExceptions(); ++i) {
        const OEParseException* e = log->GetParseException(i);
        lines.push_back(std::string(e->GetWarningString()) + " " + e->GetText().c_str() + "|" +
                        e->GetAuxText().c_str() + " " + std::to_string(e->GetTag()));
    }
    return lines;
}

struct Result {
    OEParseStatus status;
    std::unique_ptr<Agg> root;
    std::vector<std::string> log;
    OEDataObj* objectWithError;
};

inline Result Parse(const std::string& text, unsigned short checkRequired = 0, unsigned short xmlQuotes = 0) {
    OEBuffer buffer;
    buffer.WriteLarge(text.data(), static_cast<unsigned long>(text.size()));
    Result r{OEPS_OK, std::unique_ptr<Agg>(new Agg(OETAG_NONE, 1)), {}, nullptr};
    OESimpleParser parser;
    r.status = parser.Parse(&buffer, r.root.get(), checkRequired, xmlQuotes);
    r.log = LogLines();
    r.objectWithError = parser.GetObjectWithError();
    return r;
}

} // namespace testagg

#endif
