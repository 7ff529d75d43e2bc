// The tag dictionary: the compiled-in table of every OFX tag the library knows, with a name
// index (sorted by length, then bytes) and an id index, both built once.
//
// Name lookups take the case rule as an argument and pass it down to the comparison; nothing
// shared is written during a lookup, so lookups from several threads are safe once the
// dictionary exists. m_compareType only governs the sort of the name index during construction
// (qsort callbacks take no context).
#ifndef OESDK_TAGS_OETAGDICTIONARY_H
#define OESDK_TAGS_OETAGDICTIONARY_H

#include "oeexport.h"
#include "tags/oetagid.h"

#include <atomic>

// One row of a tag table.
struct OETagDictionaryEntry {
    OETagID m_id;
    const char* m_name; // upper case, no angle brackets; "" for a reserved row
};

// One record of the name index: the row and the length of its name.
struct OECompareInfo {
    const OETagDictionaryEntry* m_entry;
    unsigned short m_length;
};

// One record of the id index: position in the name index, then the id.
struct OEIdIndexInfo {
    unsigned short m_namePosition;
    OETagID m_id;
};

enum OECaseType { OECaseSensitive = 0, OECaseInsensitive = 1 };

// Binary search over an index. Compare returns the key minus the element at a position.
// Its only virtual operations are Compare and Count, in that slot order; search objects live on
// the stack, so the destructor is protected and not virtual.
class OE_API OEBinarySearch {
public:
    enum : unsigned short { kNotFound = 0xFFFF };
    virtual int Compare(unsigned short position) = 0;
    virtual unsigned short Count() = 0;
    // The position of the key, or kNotFound. Signed 16-bit bounds: at most 32767 entries.
    unsigned short Search();

protected:
    ~OEBinarySearch() = default;
};

class OE_API SearchDictionaryEntry : public OEBinarySearch {
public:
    SearchDictionaryEntry(const OECompareInfo* index, unsigned short count, const char* name,
                          unsigned short length, OECaseType caseType)
        : m_index(index), m_count(count), m_name(name), m_length(length), m_caseType(caseType) {}
    int Compare(unsigned short position) override;
    unsigned short Count() override { return m_count; }

private:
    const OECompareInfo* m_index;
    unsigned short m_count;
    const char* m_name;
    unsigned short m_length;
    OECaseType m_caseType;
};

class OE_API SearchDictionaryIndex : public OEBinarySearch {
public:
    SearchDictionaryIndex(const OEIdIndexInfo* index, unsigned short count, OETagID id)
        : m_index(index), m_count(count), m_id(id) {}
    int Compare(unsigned short position) override;
    unsigned short Count() override { return m_count; }

private:
    const OEIdIndexInfo* m_index;
    unsigned short m_count;
    OETagID m_id;
};

// The generic engine: any table of the same form.
class OE_API TagDictionary {
public:
    enum LookupMode { kContiguous = 0, kBinarySearch = 1, kLinearScan = 2 };

    TagDictionary(const OETagDictionaryEntry* table, unsigned short count);
    // Copies share the indexes: only one of the two may be destroyed.
    TagDictionary(const TagDictionary& other) = default;
    TagDictionary& operator=(const TagDictionary& other) = default;
    virtual ~TagDictionary();

    // Looks a name up (pointer and length; the name need not end at `length`). Writes the id
    // (0 when not found) through `id` and returns the row, or null.
    const OETagDictionaryEntry* GetTagID(const char* name, unsigned short length, OETagID* id,
                                         OECaseType caseType) const;
    // First row with that id in stored order, or null.
    const OETagDictionaryEntry* FindDictionaryEntry(OETagID id) const;
    // The name of an id. In the contiguous mode there is no range check: pass 1..count.
    const char* GetTagString(OETagID id) const;

    // Whether the name index could be built (lookups must not be attempted otherwise).
    bool IsUsable() const { return m_nameIndex != nullptr; }
    LookupMode GetLookupMode() const { return m_mode; }
    OETagID GetLowestID() const { return m_lowestId; }
    unsigned short GetCount() const { return m_count; }

    static int sCompareTag(const void* a, const void* b);
    static int sCompareTagID(const void* a, const void* b);
    static int sCompare(const OECompareInfo& a, const OECompareInfo& b);

    static OECaseType m_compareType;

private:
    const OETagDictionaryEntry* FindDictionaryEntry(const char* name, unsigned short length,
                                                    OECaseType caseType) const;
    unsigned short AreTagIDsContiguous() const;

    // Hash probe over the name index (exact bytes); key must already be in the table's case.
    const OETagDictionaryEntry* ProbeHash(const char* name, unsigned short length) const;
    void BuildHash();

    const OETagDictionaryEntry* m_table;
    OECompareInfo* m_nameIndex;
    unsigned short m_count;
    OEIdIndexInfo* m_idIndex;
    OETagID m_lowestId;
    LookupMode m_mode;
    // Name lookups first try an open-addressing hash over the name index (positions + 1, 0 =
    // empty slot); they give the same rows as the binary search, only sooner. Without it (memory
    // short, or a table with mixed-case names) lookups use the binary search alone.
    unsigned short* m_hash;
    unsigned int m_hashMask;
    bool m_upperCaseNames;
};

// The dictionary of the built-in OFX table, kept as a process-wide singleton.
class OE_API OETagDictionary : public TagDictionary {
public:
    OETagDictionary();
    // Clears the singleton pointer, so that the next TheOETagDictionary() builds a fresh one.
    ~OETagDictionary() override;

    // The singleton, made on first use (null when memory is short; the next call tries again).
    static OETagDictionary* TheOETagDictionary();
    // Destroys a dictionary (normally the singleton) through its virtual destructor; a null
    // pointer does nothing. Always returns 0.
    static int Destroy(OETagDictionary* dictionary);
    // Destroys the singleton, if there is one. Returns 0.
    static int Destroy() { return Destroy(ms_theOETagDictionary.load()); }

    // The singleton pointer (null until first use and after Destroy). Creation is guarded, so
    // two threads making their first lookup at once get the same dictionary.
    static std::atomic<OETagDictionary*> ms_theOETagDictionary;
};

// The built-in table and its row count (1448).
OE_API const OETagDictionaryEntry* GetOETagDictionary();
OE_API unsigned short NumberOfOEDictionaryEntry();

#endif
