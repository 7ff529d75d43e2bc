// OEDynamicArray: the base of the library's growable arrays of pointers (lists of child
// aggregates, of strings, the parse log, the thread list). Each element type has a typed
// subclass; OEPtrArray<T> below gives one in a line, owning its elements or not.
#ifndef OESDK_FOUNDATION_OEDYNARR_H
#define OESDK_FOUNDATION_OEDYNARR_H

#include "oeexport.h"
#include "foundation/oestring.h"

enum OETagID : unsigned int;
class OEBuilder;

class OE_API OEDynamicArray {
public:
    // Both values are raised to 1 when given as 0; nothing is allocated until the first store.
    OEDynamicArray(unsigned short initial = 5, unsigned short growBy = 5);
    virtual ~OEDynamicArray();
    OEDynamicArray(const OEDynamicArray&) = delete;
    OEDynamicArray& operator=(const OEDynamicArray&) = delete;

    // Whether the block may grow to `capacity` entries. The base allows any 16-bit capacity.
    virtual unsigned short OkToAlloc(unsigned short capacity) const;
    // Writing a whole array is the business of the arrays that appear in OFX; on the base it is
    // a misuse: it reports "Illegal use of OEDynamicArray::Build" and returns build status 6.
    virtual int Build(OEBuilder* builder, OETagID tag);

    unsigned short Entries() const { return m_count; }
    unsigned short Capacity() const { return m_capacity; }

protected:
    // Stores at index i, growing the block by the increment while the capacity is not above i.
    // Returns 1, or 0 when memory is short (thread error 1). Entries between the old count and
    // i are null.
    unsigned short StoreAt(unsigned short index, void* element);
    // With room left, an append is a plain store.
    unsigned short StoreAppend(void* element) {
        if (m_count >= m_capacity) return StoreAt(m_count, element);
        m_block[m_count++] = element;
        return 1;
    }
    void* ElementAt(unsigned short index) const { return index < m_count ? m_block[index] : nullptr; }
    // Takes the entry out and closes the gap; returns it (the caller decides its fate).
    void* RemoveAt(unsigned short index);
    // Inserts before index (index == Entries() appends). Returns 1, or 0 when memory is short.
    unsigned short InsertAt(unsigned short index, void* element);
    // Forgets every entry (the block stays).
    void RemoveAllEntries() { m_count = 0; }
    // The growth increment from now on (at least 1).
    void SetGrowBy(unsigned short growBy) { m_growBy = growBy ? growBy : 1; }
    unsigned short GrowBy() const { return m_growBy; }
    void** Block() const { return m_block; }

private:
    unsigned short m_capacity;
    unsigned short m_count;
    unsigned short m_initial;
    unsigned short m_growBy;
    void** m_block;
};

// A typed array of T*. With Owning = true the array deletes its elements (on destruction, on
// replacement and by DeleteAll); Disconnect hands one back without deleting it.
template <class T, bool Owning = true> class OEPtrArray : public OEDynamicArray {
public:
    OEPtrArray(unsigned short initial = 5, unsigned short growBy = 5) : OEDynamicArray(initial, growBy) {}
    ~OEPtrArray() override { DeleteAll(); }

    T* Get(unsigned short index) const { return static_cast<T*>(ElementAt(index)); }
    T* operator[](unsigned short index) const { return Get(index); }
    unsigned short Append(T* element) { return StoreAppend(element); }
    unsigned short Insert(unsigned short index, T* element) { return InsertAt(index, element); }
    // Replaces the entry at index (deleting the old one when owning).
    unsigned short Set(unsigned short index, T* element) {
        T* old = Get(index);
        if (old == element && index < Entries()) return 1;
        if (!StoreAt(index, element)) return 0;
        if (Owning) delete old;
        return 1;
    }
    T* Disconnect(unsigned short index) { return static_cast<T*>(RemoveAt(index)); }
    void Delete(unsigned short index) {
        T* old = Disconnect(index);
        if (Owning) delete old;
    }
    void DeleteAll() {
        if (Owning)
            for (unsigned short i = 0; i < Entries(); ++i) delete Get(i);
        RemoveAllEntries();
    }
    // Forgets every entry without deleting any.
    void DisconnectAll() { RemoveAllEntries(); }
};

// A growable array of owned strings.
class OE_API OEDynamicArrayString : public OEPtrArray<OEString> {
public:
    OEDynamicArrayString(unsigned short initial = 5, unsigned short growBy = 5)
        : OEPtrArray(initial, growBy) {}
    // Appends a copy of the text. Returns 1, or 0 when memory is short.
    virtual unsigned short AddString(const char* text);
    unsigned short AddString(const OEString& text);
    // The text at index, or null when the index is out of range.
    const OEString* GetString(unsigned short index) const { return Get(index); }
    // Replaces the text at index (appending when index == Entries()).
    unsigned short SetString(unsigned short index, const char* text);
    // Copies every string of another array.
    unsigned short DeepCopyFrom(const OEDynamicArrayString& other);

protected:
    virtual OEString* MakeString(const char* text);
};

// A growable array of owned strings that all share one spec length.
class OE_API OEDynamicArrayStringLen : public OEDynamicArrayString {
public:
    OEDynamicArrayStringLen(unsigned short specLength = OEString::kUnlimited, unsigned short initial = 5,
                            unsigned short growBy = 5)
        : OEDynamicArrayString(initial, growBy), m_specLength(specLength) {}
    unsigned short GetSpecLength() const { return m_specLength; }
    // Applies a new spec length to the array and to every string it holds.
    void SetSpecLength(unsigned short specLength);

protected:
    OEString* MakeString(const char* text) override;

private:
    unsigned short m_specLength;
};

#endif
