#include "foundation/oedynarr.h"

#include "foundation/oememory.h"
#include "foundation/oestatus.h"
#include "platform/oeplatform.h"

#include <cstring>

OEDynamicArray::OEDynamicArray(unsigned short initial, unsigned short growBy)
    : m_capacity(0), m_count(0), m_initial(initial ? initial : 1), m_growBy(growBy ? growBy : 1),
      m_block(nullptr) {}

OEDynamicArray::~OEDynamicArray() {
    OEMemory::Free(m_block);
}

unsigned short OEDynamicArray::OkToAlloc(unsigned short) const {
    return 1;
}

int OEDynamicArray::Build(OEBuilder*, OETagID) {
    Util::GetOps().Message(1, 0, "oedynarr", __LINE__, "OEDynamicArray::Build",
                           "Illegal use of OEDynamicArray::Build");
    return OEBS_ILLEGALUSE;
}

unsigned short OEDynamicArray::StoreAt(unsigned short index, void* element) {
    while (m_capacity <= index) {
        unsigned long step = m_block ? m_growBy : m_initial;
        if (step < 1) step = 1;
        unsigned long wanted = static_cast<unsigned long>(m_capacity) + step;
        if (wanted > 65535u) wanted = 65535u;
        if (wanted <= m_capacity || !OkToAlloc(static_cast<unsigned short>(wanted))) return 0;
        void** grown = static_cast<void**>(OEMemory::Realloc(m_block, wanted * sizeof(void*)));
        if (!grown) return 0;
        m_block = grown;
        m_capacity = static_cast<unsigned short>(wanted);
    }
    for (unsigned short i = m_count; i < index; ++i) m_block[i] = nullptr;
    m_block[index] = element;
    if (index >= m_count) m_count = static_cast<unsigned short>(index + 1);
    return 1;
}

void* OEDynamicArray::RemoveAt(unsigned short index) {
    if (index >= m_count) return nullptr;
    void* element = m_block[index];
    std::memmove(m_block + index, m_block + index + 1, (m_count - index - 1u) * sizeof(void*));
    --m_count;
    return element;
}

unsigned short OEDynamicArray::InsertAt(unsigned short index, void* element) {
    if (index > m_count) return 0;
    if (index == m_count) return StoreAt(index, element);
    void* last = m_block[m_count - 1];
    if (!StoreAt(m_count, last)) return 0;
    std::memmove(m_block + index + 1, m_block + index, (m_count - 2u - index) * sizeof(void*));
    m_block[index] = element;
    return 1;
}

OEString* OEDynamicArrayString::MakeString(const char* text) {
    return OEMemory::New<OEString>(text);
}

unsigned short OEDynamicArrayString::AddString(const char* text) {
    OEString* s = MakeString(text);
    if (!s) return 0;
    if (text && *text && s->IsNull()) { // the text itself could not be stored
        delete s;
        return 0;
    }
    if (!Append(s)) {
        delete s;
        return 0;
    }
    return 1;
}

unsigned short OEDynamicArrayString::AddString(const OEString& text) {
    unsigned short before = Entries();
    if (!AddString(text.c_str())) return 0;
    Get(before)->SetEncoding(text.GetEncoding());
    return 1;
}

unsigned short OEDynamicArrayString::SetString(unsigned short index, const char* text) {
    if (index > Entries()) return 0;
    if (index == Entries()) return AddString(text);
    OEString* s = Get(index);
    if (!s) { // a gap left by a store past the end: give it a string of its own
        s = MakeString(text);
        if (!s || (text && *text && s->IsNull()) || !Set(index, s)) {
            delete s;
            return 0;
        }
        return 1;
    }
    unsigned short spec = s->SpecLength();
    *s = text;
    s->SetSpecLength(spec);
    return (text && *text && s->IsNull()) ? 0 : 1;
}

unsigned short OEDynamicArrayString::DeepCopyFrom(const OEDynamicArrayString& other) {
    if (&other == this) return 1;
    DeleteAll();
    for (unsigned short i = 0; i < other.Entries(); ++i) {
        const OEString* s = other.Get(i);
        if (!(s ? AddString(*s) : Append(nullptr))) return 0; // gaps are copied as gaps
    }
    return 1;
}

OEString* OEDynamicArrayStringLen::MakeString(const char* text) {
    OEString* s = OEMemory::New<OEString>(text);
    if (s) s->SetSpecLength(m_specLength);
    return s;
}

void OEDynamicArrayStringLen::SetSpecLength(unsigned short specLength) {
    m_specLength = specLength;
    for (unsigned short i = 0; i < Entries(); ++i)
        if (OEString* s = Get(i)) s->SetSpecLength(specLength);
}
