#include "foundation/oebuffer.h"

#include "foundation/oememory.h"
#include "foundation/oestring.h"

#include <cstring>

namespace {
// Offsets are 32-bit and `unsigned long` is 32-bit on Windows: sums of an offset and a count are
// taken in 64 bits so that an offset set far out cannot wrap around to a small end.
inline std::uint64_t End(std::uint32_t offset, unsigned long count) {
    return static_cast<std::uint64_t>(offset) + count;
}
} // namespace

OEBuffer::OEBuffer(unsigned long initial, unsigned long growBy)
    : m_data(nullptr), m_allocation(0), m_growBy(0), m_dataSize(0), m_offset(0) {
    if (initial > kMaxBufferSize) initial = kMaxBufferSize;
    if (growBy > kMaxBufferSize) growBy = kMaxBufferSize;
    unsigned long first = initial;
    if (initial == 0) {
        first = growBy ? growBy : 512;
        growBy = first;
    }
    m_data = static_cast<char*>(OEMemory::Malloc(first));
    if (m_data) m_allocation = static_cast<std::uint32_t>(first);
    m_growBy = static_cast<std::uint32_t>(growBy);
}

OEBuffer::~OEBuffer() {
    OEMemory::Free(m_data);
}

char OEBuffer::GetCh(long pos) {
    if (pos < 0 || static_cast<unsigned long>(pos) >= m_dataSize || !m_data) return 0;
    return m_data[pos];
}

unsigned long OEBuffer::GetMaxBufferSize() {
    return kMaxBufferSize;
}

unsigned long OEBuffer::GrowBuffer(unsigned long need) {
    if (need == 0 && m_growBy == 0) return 0;
    if (m_allocation >= kMaxBufferSize) return 0;
    unsigned long add = m_growBy > need ? m_growBy : need;
    unsigned long room = kMaxBufferSize - m_allocation;
    if (add > room) add = room;
    if (add < need) return 0;
    char* grown = static_cast<char*>(OEMemory::Realloc(m_data, static_cast<size_t>(m_allocation) + add));
    if (!grown) {
        // The buffer is left without a block; what it held is released rather than leaked.
        OEMemory::Free(m_data);
        m_data = nullptr;
        m_allocation = 0;
        m_dataSize = 0;
        m_offset = 0;
        return 0;
    }
    m_data = grown;
    m_allocation = static_cast<std::uint32_t>(m_allocation + add);
    return add;
}

int OEBuffer::AllocateTo(unsigned long size) {
    if (size > kMaxBufferSize) return OEBR_GROWFAILED;
    while (m_allocation < size) {
        if (GrowBuffer(size - m_allocation) == 0) return OEBR_GROWFAILED;
    }
    return OEBR_SUCCESS;
}

int OEBuffer::EnsureRoom(unsigned long end) {
    if (!m_data) return OEBR_NOBUFFER;
    if (end >= kMaxBufferSize) return OEBR_BEYONDEND;
    if (end <= m_allocation) return OEBR_SUCCESS;
    if (m_growBy == 0) return OEBR_BEYONDEND;
    if (GrowBuffer(end - m_allocation) == 0) return OEBR_GROWFAILED;
    return OEBR_SUCCESS;
}

int OEBuffer::Write(const char* data, unsigned short length) {
    if (!data && length) return OEBR_NOBUFFER;
    std::uint64_t end64 = End(m_offset, length);
    if (end64 >= kMaxBufferSize) return m_data ? OEBR_BEYONDEND : OEBR_NOBUFFER;
    unsigned long end = static_cast<unsigned long>(end64);
    // Bytes of our own block: find them again after growth has moved the block.
    const bool own = m_data && data >= m_data && data < m_data + m_allocation;
    const std::size_t ownOffset = own ? static_cast<std::size_t>(data - m_data) : 0;
    int result = EnsureRoom(end);
    if (result != OEBR_SUCCESS) return result;
    if (own) data = m_data + ownOffset;
    if (length) std::memmove(m_data + m_offset, data, length);
    m_offset = static_cast<std::uint32_t>(end);
    m_dataSize = m_offset;
    return OEBR_SUCCESS;
}

int OEBuffer::Write(char c) {
    return Write(&c, 1);
}

int OEBuffer::Write(OEBuffer* other) {
    if (!other || !other->m_data) return OEBR_NOBUFFER;
    return WriteLarge(other->m_data, other->m_dataSize);
}

int OEBuffer::WriteString(const char* text) {
    if (!text) return OEBR_SUCCESS;
    return WriteLarge(text, static_cast<unsigned long>(std::strlen(text)));
}

int OEBuffer::WriteLarge(const char* data, unsigned long length) {
    if (m_data && length > kLargeWritePiece && data >= m_data && data < m_data + m_allocation) {
        // A piece of our own block: the first growth would leave the later pieces behind.
        char* copy = static_cast<char*>(OEMemory::Malloc(length));
        if (!copy) return OEBR_GROWFAILED;
        std::memcpy(copy, data, length);
        int result = WriteLarge(copy, length);
        OEMemory::Free(copy);
        return result;
    }
    while (length > kLargeWritePiece) {
        int result = Write(data, static_cast<unsigned short>(kLargeWritePiece));
        if (result != OEBR_SUCCESS) return result;
        data += kLargeWritePiece;
        length -= kLargeWritePiece;
    }
    return Write(data, static_cast<unsigned short>(length));
}

int OEBuffer::GetBufData(char* out, unsigned short count) {
    if (!m_data) return OEBR_NOBUFFER;
    if (End(m_offset, count) > m_dataSize) return OEBR_BEYONDEND;
    std::memcpy(out, m_data + m_offset, count);
    m_offset += count;
    return OEBR_SUCCESS;
}

int OEBuffer::Read(char* out) {
    if (!out) return OEBR_NOBUFFER;
    return GetBufData(out, 1);
}

int OEBuffer::Read(char* out, unsigned short& got, unsigned short count) {
    got = 0;
    if (!out) return OEBR_NOBUFFER;
    int result = GetBufData(out, count);
    if (result == OEBR_SUCCESS) got = count;
    return result;
}

unsigned short OEBuffer::FindSubChar(unsigned long from, char ch, unsigned long& pos) {
    if (!m_data || from >= m_dataSize) {
        pos = from;
        return 0;
    }
    const char* start = m_data + from;
    size_t span = m_dataSize - from;
    // Stop at the first ch or 0 byte, whichever comes first.
    const char* hit = static_cast<const char*>(std::memchr(start, ch, span));
    const char* zero =
        ch ? static_cast<const char*>(std::memchr(start, 0, hit ? size_t(hit - start) : span)) : nullptr;
    if (zero) {
        pos = static_cast<unsigned long>(zero - m_data);
        return 0;
    }
    if (hit && ch) {
        pos = static_cast<unsigned long>(hit - m_data);
        return 1;
    }
    pos = hit ? static_cast<unsigned long>(hit - m_data) : m_dataSize;
    return 0;
}

unsigned long OEBuffer::GetData(OEString& out, unsigned long from, unsigned long length) {
    if (!m_data || from >= m_dataSize) {
        out = "";
        return 0;
    }
    unsigned long available = m_dataSize - from;
    if (length > available) length = available;
    const void* zero = std::memchr(m_data + from, 0, length);
    if (zero) length = static_cast<unsigned long>(static_cast<const char*>(zero) - (m_data + from));
    if (length > OEString::kMaxLength) length = OEString::kMaxLength;
    if (length == 0) {
        out = "";
        return 0;
    }
    out.Assign(m_data + from, static_cast<unsigned short>(length));
    return out.GetStrLength();
}

void OEBuffer::ClearBuffer(char c) {
    if (m_data) std::memset(m_data, c, m_allocation);
    m_dataSize = 0;
    m_offset = 0;
}

int OEBuffer::CompareBuffer(OEBuffer* other) {
    if (!other) return 1;
    std::uint32_t common = m_dataSize < other->m_dataSize ? m_dataSize : other->m_dataSize;
    int c = common ? std::memcmp(m_data, other->m_data, common) : 0;
    if (c != 0) return c;
    if (m_dataSize == other->m_dataSize) return 0;
    return m_dataSize < other->m_dataSize ? -1 : 1;
}

int OEBuffer::CopyBuffer(OEBuffer* source, unsigned long from, unsigned long length) {
    if (!source || !source->m_data) return OEBR_NOBUFFER;
    if (from > source->m_dataSize || length > source->m_dataSize - from) return OEBR_BEYONDEND;
    return WriteLarge(source->m_data + from, length);
}
