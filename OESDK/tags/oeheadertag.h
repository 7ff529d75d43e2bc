// The names of the header lines in front of an OFX body. 0 and 1 are MIME headers; 2 to 10 are
// the OFX headers proper. -1 stands for a header line whose name is none of these.
#ifndef OESDK_TAGS_OEHEADERTAG_H
#define OESDK_TAGS_OEHEADERTAG_H

enum OEHeaderTag : int {
    OEHT_UNKNOWN = -1,
    OEHT_CONTENTTYPE = 0,   // "CONTENT-TYPE"
    OEHT_CONTENTLENGTH = 1, // "CONTENT-LENGTH"
    OEHT_OFXHEADER = 2,     // "OFXHEADER"
    OEHT_DATA = 3,          // "DATA"
    OEHT_VERSION = 4,       // "VERSION"
    OEHT_SECURITY = 5,      // "SECURITY"
    OEHT_ENCODING = 6,      // "ENCODING"
    OEHT_CHARSET = 7,       // "CHARSET"
    OEHT_COMPRESSION = 8,   // "COMPRESSION"
    OEHT_OLDFILEUID = 9,    // "OLDFILEUID"
    OEHT_NEWFILEUID = 10    // "NEWFILEUID"
};

#endif
