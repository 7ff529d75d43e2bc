// The OFX file envelope: header lines, a blank line and a body of one or more "OFX" aggregates;
// optionally MIME headers and multipart subfiles.
//
//   OEFile      headers, MIME data, subfiles (type MIME)
//   OEFileOFX   the OFX header rules: defaults, the version header's choice, validation
//   OEFileBodies  the bodies of a request or response file, in order
//   OEFileRq    the requests of a file to send (type OFXFILERQ)
//   OEFileRs    the responses of a file received (type OFXFILERS)
#ifndef OESDK_FILE_OEFILE_H
#define OESDK_FILE_OEFILE_H
#include "oeexport.h"
#include "file/oemimeheader.h"
#include "foundation/oedynarr.h"
#include "foundation/oestring.h"
#include "tags/oedataobj.h"

class OERequest;
class OEResponse;

// The MIME names and content type the file layer writes.
extern OE_API const char OEMIME_CONTENTLENGTH[]; // "content-length"
extern OE_API const char OEMIME_CONTENTTYPE[];   // "content-type"
extern OE_API const char OEMIME_OFXTYPE[];       // "application/x-ofx"

class OE_API OEFile : public OEDataObj {
public:
    explicit OEFile(unsigned short version = 0);
    ~OEFile() override;
    OEFile(const OEFile&) = delete;
    OEFile& operator=(const OEFile&) = delete;

    // Stores a copy for an OFX header (2 to 10). 0, storing nothing, for another tag or a null or
    // blank value.
    unsigned short SetHeader(OEHeaderTag tag, const OEString* value);
    unsigned short SetHeader(OEHeaderTag tag, const char* value);
    const OEString* GetHeader(OEHeaderTag tag) const;
    virtual unsigned short ValidateHeader(OEHeaderTag tag) const { return GetHeader(tag) ? 1 : 0; }
    // Always 1 here; OEFileOFX checks its headers.
    virtual unsigned short ValidateHeaders() { return 1; }
    // One header line: a blank value is ignored; an OFX header is stored; anything else becomes a
    // MIME header (3 when it has no name).
    OEParseStatus HandleHeader(OEHeaderTag tag, const OEString& value, OEString* name) override;

    unsigned short GetNumMIMEHeaders() const { return m_mime.Entries(); }
    OEMIMEHeader* GetMIMEHeader(unsigned short index) const { return m_mime.Get(index); }
    OEMIMEHeader* GetMIMEHeader(const OEString* name) const;
    void SetBoundary(const OEString& boundary) { m_boundary = boundary; }
    const OEString& GetBoundary() const { return m_boundary; }
    void SetMIMEBody(const OEString& body) { m_mimeBody = body; }
    const OEString& GetMIMEBody() const { return m_mimeBody; }

    // Stores a copy made through the factory, not the caller's object.
    // Writing a multipart file: each part is built on its own (with its own header block unless
    // it has the omit-headers flag), gets "content-length" (and "content-type" for an OFX request
    // or response file), and is written as its headers (MIME, then OFX) followed by that text.
    // So a part without the flag carries its OFX header block twice; give parts the flag to
    // write the block once, with "content-length" counting the part's body.
    unsigned short AppendSubfile(const OEFile* subfile);
    unsigned short SetSubfile(unsigned short index, const OEFile* subfile);
    OEFile* GetSubfile(unsigned short index) const { return m_subfiles.Get(index); }
    unsigned short GetNumberOfSubfiles() const { return m_subfiles.Entries(); }
    OEDataObj* GetChild(unsigned short index) const override;
    unsigned short GetNumberOfChildren() const override;

    // When set, Build writes no header block (a file embedded elsewhere, or an XML-form document
    // whose caller writes its own declaration).
    void SetOmitHeaders(unsigned short omit) { m_omitHeaders = omit; }
    unsigned short GetOmitHeaders() const { return m_omitHeaders; }

    virtual int BuildHeaders(OEBuilder* builder);
    int Build(OEBuilder* builder) override;
    virtual unsigned short DeepCopyFrom(const OEFile* other);

protected:
    OEPtrArray<OEMIMEHeader> m_mime;
    unsigned short m_omitHeaders;
    OEString m_boundary;
    OEString m_mimeBody;
    OEPtrArray<OEFile> m_subfiles;
    OEString m_headers[11]; // indexed by OEHeaderTag; empty until set
    bool m_headerSet[11];
};

class OE_API OEFileOFX : public OEFile {
public:
    explicit OEFileOFX(unsigned short version = 0);
    unsigned short GetMFAHeaderRequired() const { return m_mfa; }
    void SetMFAHeaderRequired(unsigned short mfa) { m_mfa = mfa; }
    // Fills every unset OFX header with its default; the version argument (0: the file's, else
    // 1) chooses "151" for 2, else "102" ("103" with the MFA flag). Returns 1.
    virtual unsigned short AddDefaultOFXHeaders(unsigned short version);
    // Checks the stored headers after parsing. Missing headers and a bad OFXHEADER, VERSION or
    // CHARSET are logged and tolerated; only a bad DATA, ENCODING or COMPRESSION makes the file
    // unacceptable (0). The leniency is deliberate.
    unsigned short ValidateHeaders() override;
    unsigned short AllRequiredPresent() override;
    int BuildHeaders(OEBuilder* builder) override;
    unsigned short DeepCopyFrom(const OEFile* other) override;
    // The default text of an OFX header for the given version.
    const char* DefaultHeader(OEHeaderTag tag, unsigned short version) const;

protected:
    unsigned short m_mfa;
};

// The common part of the request and response files: the bodies (OFX aggregates) in order,
// made through the factory. `request` selects the side.
class OE_API OEFileBodies : public OEFileOFX {
public:
    OEFileBodies(unsigned short version, bool request);
    ~OEFileBodies() override;
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;
    // An element directly under the file is an error: logged as OEPW_INVALIDELEM, status 4.
    OEParseStatus HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) override;
    using OEFileOFX::HandleTagElement;
    OEDataObj* GetChild(unsigned short index) const override;
    unsigned short GetNumberOfChildren() const override;
    unsigned short DeepCopyFrom(const OEFile* other) override;

protected:
    // A null body or an index above the count is refused (0); equal to the count appends.
    unsigned short StoreBody(unsigned short index, OEDataObj* body);
    // Writes every body in order: the first failure's status, else 0.
    int BuildBodies(OEBuilder* builder);

    bool m_request;
    OEPtrArray<OEDataObj> m_bodies;

private:
    OEDataObj* NewBody(OEDataObjFactory* factory, unsigned short version) const;
};

class OE_API OEFileRq : public OEFileBodies {
public:
    explicit OEFileRq(unsigned short version = 0);
    unsigned short AppendRequest(OERequest* request);
    unsigned short SetRequest(unsigned short index, OERequest* request);
    OERequest* GetRequest(unsigned short index) const;
    unsigned short GetNumberOfRequest() const { return m_bodies.Entries(); }
    // The header block, then every request, even when the header block failed.
    int Build(OEBuilder* builder) override;
};

class OE_API OEFileRs : public OEFileBodies {
public:
    explicit OEFileRs(unsigned short version = 0);
    unsigned short AppendResponse(OEResponse* response);
    unsigned short SetResponse(unsigned short index, OEResponse* response);
    OEResponse* GetResponse(unsigned short index) const;
    unsigned short GetNumberOfResponse() const { return m_bodies.Entries(); }
    // The header block, then every response; stops at once when the header block failed.
    int Build(OEBuilder* builder) override;
};

#endif
