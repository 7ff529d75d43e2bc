// OEString: the library's text. A NUL-terminated byte string with 16-bit lengths, a spec length
// (the most characters the OFX field allows; 65535 = unlimited) and an encoding mark (plain or
// CDATA-wrapped). The spec length is never enforced on assignment: text is stored whole and the
// owner asks ExceedsSpecLength() or calls TruncateToSpec().
//
// Lengths are 16-bit: a text of 65535 bytes or more is stored cut at 65534 bytes.
#ifndef OESDK_FOUNDATION_OESTRING_H
#define OESDK_FOUNDATION_OESTRING_H

#include "oeexport.h"

enum OEStringEncode { OESE_PLAIN = 0, OESE_CDATA = 1 };

class OE_API OEString {
public:
    enum : unsigned short { kUnlimited = 65535, kMaxLength = 65534 };

    OEString()
        : m_specLength(kUnlimited), m_buffer(nullptr), m_bufferSize(0), m_length(0), m_encoding(OESE_PLAIN) {}
    OEString(const char* text);
    // A slice of `length` bytes (need not be NUL-terminated; stops at an embedded NUL).
    OEString(const char* text, unsigned short length);
    OEString(const OEString& other);
    OEString(OEString&& other) noexcept;

    virtual ~OEString();
    // Copies text, encoding and spec length; an empty source makes this empty.
    virtual OEString& operator=(const OEString& other);
    // Strings of a field whose limit depends on the message-set version override this.
    virtual unsigned short SetMsgSetVersion(unsigned short version);
    // 1 when the length does not exceed the spec length.
    virtual unsigned short IsValid() const;
    virtual void SetSpecLength(unsigned short specLength);
    // Cuts the text at n characters when n is at most the buffer size.
    virtual void Truncate(unsigned short n);
    virtual void TruncateToSpec();

    OEString& operator=(OEString&& other) noexcept;
    OEString& operator=(const char* text);
    OEString& operator+=(const char* text);
    OEString& operator+=(char c);

    // Takes another string's text and encoding but keeps this string's spec length (the limit
    // belongs to the field). Returns 1, or 0 when memory is short (the string is then empty).
    unsigned short AssignText(const OEString& other);

    // Replaces the text by a slice of `length` bytes (stops early at a NUL); the buffer grows to
    // exactly length + 1 when it is too small. Returns 1, or 0 when memory is short.
    unsigned short Assign(const char* text, unsigned short length);

    bool operator==(const OEString& other) const;
    bool operator!=(const OEString& other) const { return !(*this == other); }
    bool operator==(const char* text) const;
    bool operator!=(const char* text) const { return !(*this == text); }
    // 0 when equal ignoring ASCII case; otherwise the sign of the first difference.
    int strcmpi(const char* text) const;

    operator const char*() const { return m_buffer ? m_buffer : ""; }
    const char* c_str() const { return m_buffer ? m_buffer : ""; }

    // Grows the buffer to at least `size` bytes and hands it out for writing (null when memory
    // is short); UnlockBuffer() then puts a NUL in the last byte and recomputes the length.
    char* LockBuffer(unsigned short size);
    void UnlockBuffer();

    // Fills the whole buffer with c, NUL in the last byte, and recomputes the length.
    void Clear(char c);

    unsigned short ExceedsSpecLength() const { return m_length > m_specLength ? 1 : 0; }
    unsigned short IsEmpty() const { return m_length == 0 ? 1 : 0; }
    unsigned short IsNull() const { return m_buffer == nullptr ? 1 : 0; }
    // Empty, or only space, line feed, carriage return and tab.
    unsigned short IsWhiteSpace() const;
    unsigned short GetStrLength() const { return m_length; }
    unsigned short BufferSize() const { return m_bufferSize; }
    unsigned short SpecLength() const { return m_specLength; }

    void MakeUpper();
    void MakeLower();
    // Remove the space character only (not tabs or line ends).
    void TrimLeadingSpaces();
    void TrimTrailingSpaces();

    // Wraps the text in "<![CDATA[" ... "]]>" unless it already starts so; encoding becomes CDATA.
    void ToCDATA();
    // Unwraps a "<![CDATA[" text (its last three characters are taken to be "]]>"); encoding
    // becomes plain either way.
    void FromCDATA();
    OEStringEncode GetEncoding() const { return m_encoding; }
    void SetEncoding(OEStringEncode encoding) { m_encoding = encoding; }

protected:
    // Grows the buffer to exactly `size` bytes when it is smaller; a first buffer is
    // zero-filled. Returns 1, or 0 (thread error 1, no buffer kept) when memory is short.
    unsigned short AllocStringBuffer(unsigned short size);
    // Moves the text into a buffer of exactly `size` bytes (> the current size); a first buffer is
    // zero-filled when asked. 0 (no buffer kept) when memory is short.
    unsigned short GrowBuffer(unsigned short size, bool zeroFirst);
    // Copy-in: null or empty frees the buffer and resets the string, spec length included.
    unsigned short CopyString(const char* text);
    // Copy-in of 1 to kMaxLength bytes without NUL from outside the buffer (never zero-fills).
    unsigned short CopyText(const char* text, unsigned short length);
    void FreeBuffer();

    unsigned short m_specLength;
    char* m_buffer;
    unsigned short m_bufferSize;
    unsigned short m_length;
    OEStringEncode m_encoding;
};

// A string whose class fixes its spec length. Assignment from any OEString keeps the class's
// limit only until the copied spec length replaces it, exactly as OEString's assignment does.
template <unsigned short N> class OEBoundedString : public OEString {
public:
    enum : unsigned short { kSpecLength = N };
    OEBoundedString() { m_specLength = N; }
    OEBoundedString(const char* text) : OEString(text) { m_specLength = N; }
    OEBoundedString(const OEBoundedString& other) : OEString(other) {}
    OEBoundedString(const OEString& other) : OEString(other) { m_specLength = N; }
    OEBoundedString& operator=(const OEBoundedString& other) {
        OEString::operator=(other);
        return *this;
    }
    OEBoundedString& operator=(const char* text) {
        OEString::operator=(text);
        return *this;
    }
    using OEString::operator=;
};

typedef OEBoundedString<3> OEString3;
typedef OEBoundedString<12> OEString12;
typedef OEBoundedString<32> OEString32;
typedef OEBoundedString<36> OEString36;
typedef OEBoundedString<255> OEString255;
typedef OEBoundedString<360> OEString360;
typedef OEBoundedString<2000> OEString2000;

// A string whose spec length is chosen by its owner (for example per message-set version) and
// survives assignment: the field's limit belongs to the field, not to the value.
class OE_API OEMultiLenString : public OEString {
public:
    OEMultiLenString() {}
    OEMultiLenString(const char* text) : OEString(text) {}
    OEMultiLenString(const OEMultiLenString& other) : OEString(other) {}
    // Takes the text and encoding only: the limit stays unlimited until the owner sets it.
    OEMultiLenString(const OEString& other) : OEString(other) { m_specLength = kUnlimited; }
    OEMultiLenString& operator=(const OEString& other) override;
    OEMultiLenString& operator=(const OEMultiLenString& other) {
        operator=(static_cast<const OEString&>(other));
        return *this;
    }
    OEMultiLenString& operator=(const char* text) {
        OEString::operator=(text);
        return *this;
    }
};

#endif
