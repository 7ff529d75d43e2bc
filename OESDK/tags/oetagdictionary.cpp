#include "tags/oetagdictionary.h"

#include "foundation/oememory.h"
#include "foundation/oethread.h"

#include <cctype>
#include <cstdlib>
#include <cstring>
#include <mutex>

OECaseType TagDictionary::m_compareType = OECaseSensitive;
std::atomic<OETagDictionary*> OETagDictionary::ms_theOETagDictionary{nullptr};

namespace {

// Byte comparison over n bytes, ASCII case folded when asked.
inline int CompareBytes(const char* a, const char* b, unsigned short n, OECaseType caseType) {
    if (caseType == OECaseSensitive) return std::strncmp(a, b, n);
    for (unsigned short i = 0; i < n; ++i) {
        int ca = std::toupper(static_cast<unsigned char>(a[i]));
        int cb = std::toupper(static_cast<unsigned char>(b[i]));
        if (ca != cb) return ca - cb;
        if (ca == 0) return 0;
    }
    return 0;
}

// The name order: shorter names first, then bytes.
inline int CompareNames(const char* a, unsigned short lengthA, const char* b, unsigned short lengthB,
                        OECaseType caseType) {
    if (lengthA != lengthB) return static_cast<int>(lengthA) - static_cast<int>(lengthB);
    return CompareBytes(a, b, lengthA, caseType);
}

inline unsigned int HashName(const char* name, unsigned short length) {
    unsigned int h = 2166136261u;
    for (unsigned short i = 0; i < length; ++i) h = (h ^ static_cast<unsigned char>(name[i])) * 16777619u;
    return h ^ length;
}

std::mutex& SingletonMutex() {
    static std::mutex m;
    return m;
}

} // namespace

unsigned short OEBinarySearch::Search() {
    short lo = 0;
    short hi = static_cast<short>(Count() - 1);
    while (lo <= hi) {
        short mid = static_cast<short>((lo + hi) / 2);
        int c = Compare(static_cast<unsigned short>(mid));
        if (c == 0) return static_cast<unsigned short>(mid);
        if (c < 0)
            hi = static_cast<short>(mid - 1);
        else
            lo = static_cast<short>(mid + 1);
    }
    return kNotFound;
}

int SearchDictionaryEntry::Compare(unsigned short position) {
    const OECompareInfo& e = m_index[position];
    return CompareNames(m_name, m_length, e.m_entry->m_name, e.m_length, m_caseType);
}

int SearchDictionaryIndex::Compare(unsigned short position) {
    return static_cast<int>(m_id) - static_cast<int>(m_index[position].m_id);
}

int TagDictionary::sCompare(const OECompareInfo& a, const OECompareInfo& b) {
    return CompareNames(a.m_entry->m_name, a.m_length, b.m_entry->m_name, b.m_length, m_compareType);
}

int TagDictionary::sCompareTag(const void* a, const void* b) {
    return sCompare(*static_cast<const OECompareInfo*>(a), *static_cast<const OECompareInfo*>(b));
}

int TagDictionary::sCompareTagID(const void* a, const void* b) {
    unsigned short ia = static_cast<unsigned short>(static_cast<const OEIdIndexInfo*>(a)->m_id & 0xFFFFu);
    unsigned short ib = static_cast<unsigned short>(static_cast<const OEIdIndexInfo*>(b)->m_id & 0xFFFFu);
    return static_cast<int>(ia) - static_cast<int>(ib);
}

TagDictionary::TagDictionary(const OETagDictionaryEntry* table, unsigned short count)
    : m_table(table), m_nameIndex(nullptr), m_count(count), m_idIndex(nullptr), m_lowestId(OETAG_NONE),
      m_mode(kContiguous), m_hash(nullptr), m_hashMask(0), m_upperCaseNames(false) {
    m_compareType = OECaseSensitive;
    if (!table) {
        m_count = 0;
        return;
    }
    m_nameIndex = static_cast<OECompareInfo*>(OEMemory::Malloc(sizeof(OECompareInfo) * (count ? count : 1)));
    if (!m_nameIndex) {
        // Error code 1 is recorded and name lookups find nothing; an id lookup that is tried
        // anyway scans the table rather than reading an index that is not there.
        m_mode = kLinearScan;
        return;
    }
    for (unsigned short i = 0; i < count; ++i) {
        m_nameIndex[i].m_entry = &table[i];
        m_nameIndex[i].m_length = static_cast<unsigned short>(std::strlen(table[i].m_name));
    }
    std::qsort(m_nameIndex, count, sizeof(OECompareInfo), &TagDictionary::sCompareTag);
    BuildHash();

    m_idIndex = static_cast<OEIdIndexInfo*>(OEMemory::Malloc(sizeof(OEIdIndexInfo) * (count ? count : 1)));
    if (!m_idIndex) {
        m_mode = kLinearScan;
        return;
    }
    for (unsigned short i = 0; i < count; ++i) {
        m_idIndex[i].m_namePosition = i;
        m_idIndex[i].m_id = m_nameIndex[i].m_entry->m_id;
    }
    std::qsort(m_idIndex, count, sizeof(OEIdIndexInfo), &TagDictionary::sCompareTagID);
    if (AreTagIDsContiguous()) {
        m_mode = kContiguous;
        m_lowestId = count ? m_idIndex[0].m_id : OETAG_NONE;
    } else {
        m_mode = kBinarySearch;
    }
}

TagDictionary::~TagDictionary() {
    OEMemory::Free(m_nameIndex);
    OEMemory::Free(m_idIndex);
    OEMemory::Free(m_hash);
}

void TagDictionary::BuildHash() {
    m_upperCaseNames = true;
    for (unsigned short i = 0; i < m_count && m_upperCaseNames; ++i)
        for (const char* p = m_table[i].m_name; *p; ++p)
            if (std::islower(static_cast<unsigned char>(*p))) {
                m_upperCaseNames = false;
                break;
            }
    unsigned int size = 16;
    while (size < 2u * m_count) size <<= 1;
    // The hash is an accelerator: failing to allocate it is not an error of the dictionary.
    m_hash = static_cast<unsigned short*>(std::calloc(size, sizeof(unsigned short)));
    if (!m_hash) return;
    m_hashMask = size - 1;
    for (unsigned short i = 0; i < m_count; ++i) {
        unsigned int slot = HashName(m_nameIndex[i].m_entry->m_name, m_nameIndex[i].m_length) & m_hashMask;
        while (m_hash[slot]) slot = (slot + 1) & m_hashMask;
        m_hash[slot] = static_cast<unsigned short>(i + 1);
    }
}

const OETagDictionaryEntry* TagDictionary::ProbeHash(const char* name, unsigned short length) const {
    unsigned int slot = HashName(name, length) & m_hashMask;
    while (unsigned short position = m_hash[slot]) {
        const OECompareInfo& e = m_nameIndex[position - 1];
        if (e.m_length == length && std::memcmp(e.m_entry->m_name, name, length) == 0) return e.m_entry;
        slot = (slot + 1) & m_hashMask;
    }
    return nullptr;
}

unsigned short TagDictionary::AreTagIDsContiguous() const {
    for (unsigned short i = 1; i < m_count; ++i)
        if (m_idIndex[i].m_id != m_idIndex[i - 1].m_id + 1) return 0;
    return 1;
}

const OETagDictionaryEntry* TagDictionary::FindDictionaryEntry(const char* name, unsigned short length,
                                                               OECaseType caseType) const {
    if (!m_nameIndex || !name) return nullptr;
    if (m_hash && m_count < 32768) {
        if (caseType == OECaseSensitive) return ProbeHash(name, length);
        if (m_upperCaseNames && length <= 64) {
            // Every name is upper case, so folding the key finds the same row the folded
            // comparison would.
            char folded[64];
            for (unsigned short i = 0; i < length; ++i)
                folded[i] = static_cast<char>(std::toupper(static_cast<unsigned char>(name[i])));
            return ProbeHash(folded, length);
        }
    }
    SearchDictionaryEntry search(m_nameIndex, m_count, name, length, caseType);
    unsigned short position = search.Search();
    return position == OEBinarySearch::kNotFound ? nullptr : m_nameIndex[position].m_entry;
}

const OETagDictionaryEntry* TagDictionary::GetTagID(const char* name, unsigned short length, OETagID* id,
                                                    OECaseType caseType) const {
    const OETagDictionaryEntry* entry = FindDictionaryEntry(name, length, caseType);
    if (id) *id = entry ? entry->m_id : OETAG_NONE;
    return entry;
}

const OETagDictionaryEntry* TagDictionary::FindDictionaryEntry(OETagID id) const {
    for (unsigned short i = 0; i < m_count; ++i)
        if (m_table[i].m_id == id) return &m_table[i];
    return nullptr;
}

const char* TagDictionary::GetTagString(OETagID id) const {
    switch (m_mode) {
    case kContiguous: {
        // The fast path every name written by the builder takes: no range check.
        unsigned short position = static_cast<unsigned short>((id & 0xFFFFu) - (m_lowestId & 0xFFFFu));
        return m_nameIndex[m_idIndex[position].m_namePosition].m_entry->m_name;
    }
    case kBinarySearch: {
        SearchDictionaryIndex search(m_idIndex, m_count, id);
        unsigned short position = search.Search();
        return position == OEBinarySearch::kNotFound ? nullptr : m_table[position].m_name;
    }
    case kLinearScan:
    default: {
        const OETagDictionaryEntry* entry = FindDictionaryEntry(id);
        return entry ? entry->m_name : nullptr;
    }
    }
}

OETagDictionary::OETagDictionary() : TagDictionary(GetOETagDictionary(), NumberOfOEDictionaryEntry()) {}

OETagDictionary::~OETagDictionary() {
    // Any dictionary's end retires the singleton, not only the singleton's own: a copy shares its
    // indexes, so after one of the two is gone the next lookup must build a fresh dictionary.
    ms_theOETagDictionary.store(nullptr, std::memory_order_release);
}

OETagDictionary* OETagDictionary::TheOETagDictionary() {
    OETagDictionary* d = ms_theOETagDictionary.load(std::memory_order_acquire);
    if (d) return d;
    std::lock_guard<std::mutex> lock(SingletonMutex());
    d = ms_theOETagDictionary.load(std::memory_order_acquire);
    if (d) return d;
    d = OEMemory::New<OETagDictionary>();
    if (d && !d->IsUsable()) {
        // The name index could not be made: report failure and try again next time.
        delete d;
        d = nullptr;
    }
    ms_theOETagDictionary.store(d, std::memory_order_release);
    return d;
}

int OETagDictionary::Destroy(OETagDictionary* dictionary) {
    delete dictionary;
    return 0;
}
