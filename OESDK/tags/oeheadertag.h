// The names of the header lines in front of an OFX body. 0 and 1 are MIME headers; 2 to 10 are
// the OFX headers proper. -1 stands for a header line whose name is none of these.
#ifndef OESDK_TAGS_OEHEADERTAG_H
#define OESDK_TAGS_OEHEADERTAG_H

#include "foundation/oeenums.h" // enum OEHeaderTag (OEHT_UNKNOWN = -1, then 0 to 10)

#endif
