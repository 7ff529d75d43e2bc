// OEBuffer: one growable block of bytes with a position for reading and writing. It holds a
// whole OFX document for the tokenizer, and the builder and transports write into it.
#ifndef OESDK_FOUNDATION_OEBUFFER_H
#define OESDK_FOUNDATION_OEBUFFER_H

#include "oeexport.h"

#include <cstdint>

class OEString;

enum OEBufferResult {
    OEBR_SUCCESS = 0,
    OEBR_BEYONDEND = -9996,  // read past the data, write reaching the maximum, or no growth allowed
    OEBR_GROWFAILED = -9997, // growth failed (increment non-zero), or AllocateTo failed
    OEBR_NOBUFFER = -9998    // no data block
};

class OE_API OEBuffer {
public:
    enum : std::uint32_t { kMaxBufferSize = 4000000000u, kLargeWritePiece = 16384 };

    // initial 0: growBy (or 512 when that is 0 too) is both the first allocation and the
    // increment. Otherwise `initial` bytes, then growBy as the increment (0: never grows).
    OEBuffer(unsigned long initial = 0, unsigned long growBy = 0);
    ~OEBuffer();
    OEBuffer(const OEBuffer&) = delete;
    OEBuffer& operator=(const OEBuffer&) = delete;

    // The byte at pos, or 0 when pos is negative or not below the data size.
    virtual char GetCh(long pos);
    virtual unsigned long GetMaxBufferSize();

    // Grows until the allocation is at least `size`; OEBR_GROWFAILED when that fails.
    int AllocateTo(unsigned long size);

    // Writing copies at the offset (growing first when needed); afterwards the offset and the
    // data size both equal the end of what was written.
    int Write(const char* data, unsigned short length);
    int Write(char c);
    int Write(OEBuffer* other);
    int WriteString(const char* text);
    // Writes in pieces of 16384 bytes, each grown and copied in turn, then the remainder.
    int WriteLarge(const char* data, unsigned long length);
    OEBuffer& operator+=(const char* text) {
        WriteString(text);
        return *this;
    }
    OEBuffer& operator+=(char c) {
        Write(c);
        return *this;
    }

    // Reads one byte at the offset and advances.
    int Read(char* out);
    // Reads exactly `count` bytes at the offset into out and advances; `got` receives the count
    // read (0 when the count would pass the data size: nothing is copied then).
    int Read(char* out, unsigned short& got, unsigned short count);

    // Scans forward from `from` for ch. Found: pos = its position, returns 1. A 0 byte or the end
    // of the data first: pos = where the scan stopped (`from` when that byte is already 0), 0.
    unsigned short FindSubChar(unsigned long from, char ch, unsigned long& pos);
    // Copies up to `length` bytes from `from` into the string, stopping early at a 0 byte or the
    // end of the data. Returns the number of bytes copied.
    unsigned long GetData(OEString& out, unsigned long from, unsigned long length);

    unsigned long GetBufferOffset() const { return m_offset; }
    void SetBufferOffset(unsigned long offset) { m_offset = static_cast<std::uint32_t>(offset); }
    unsigned long GetBufferSize() const { return m_dataSize; }
    // Sets the data size (clamped to the allocation). Inline: the builder calls it once per write.
    void SetBufferSize(unsigned long size) {
        m_dataSize = static_cast<std::uint32_t>(size > m_allocation ? m_allocation : size);
    }
    unsigned long GetBufferAllocation() const { return m_allocation; }
    unsigned long GetGrowBy() const { return m_growBy; }
    char* GetBufferPtr() { return m_data; }
    const char* GetBufferPtr() const { return m_data; }
    // The block, only while the allocation is below 65535 bytes (for 16-bit callers); else null.
    char* GetSmallBufferPtr() { return m_allocation < 65535u ? m_data : nullptr; }

    // Fills the whole allocation with c and empties the buffer (data size and offset 0).
    void ClearBuffer(char c);
    // 0 when both hold the same data; otherwise negative or positive like memcmp (a shorter
    // buffer that is a prefix of the other sorts first).
    int CompareBuffer(OEBuffer* other);
    // Writes `length` bytes of `source` starting at `from` at this buffer's offset.
    int CopyBuffer(OEBuffer* source, unsigned long from, unsigned long length);

private:
    // Adds max(increment, need) bytes, never past the maximum. Returns the bytes added (0 on
    // failure; a failed realloc also sets thread error 1 and leaves the buffer without a block).
    unsigned long GrowBuffer(unsigned long need);
    int EnsureRoom(unsigned long end);
    int GetBufData(char* out, unsigned short count);

    char* m_data;
    std::uint32_t m_allocation;
    std::uint32_t m_growBy;
    std::uint32_t m_dataSize;
    std::uint32_t m_offset;
};

#endif
