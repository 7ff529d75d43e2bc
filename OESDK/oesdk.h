// OESDK: the whole public API in one header. Compile the host with -I pointing at this folder
// (or at include/OESDK of an installation) and include "oesdk.h".
#ifndef OESDK_OESDK_H
#define OESDK_OESDK_H

#include "oeexport.h"

// Platform layer
#include "platform/oeplatform.h"
#include "platform/oehttpclient.h"

// Foundation types
#include "foundation/oememory.h"
#include "foundation/oestatus.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oestring.h"
#include "foundation/oebuffer.h"
#include "foundation/oedynarr.h"
#include "foundation/oethread.h"
#include "foundation/oeprecision.h"
#include "foundation/oedatetime.h"
#include "foundation/oelanguage.h"
#include "foundation/oeenums.h"
#include "foundation/oedataconv.h"
#include "foundation/oepayrollamount.h"
#include "foundation/oepayrollenums.h"
#include "foundation/oepayrolldataconv.h"

// Tags and data objects
#include "tags/oetagid.h"
#include "tags/oetagdictionary.h"
#include "tags/oeheadertag.h"
#include "tags/oedataobj.h"
#include "tags/oedatafactory.h"

// Parsing
#include "parse/oeparseexception.h"
#include "parse/oeparselogger.h"
#include "parse/oeutility.h"
#include "parse/oeparseengine.h"
#include "parse/oeparser.h"

// Building
#include "build/oebuilder.h"

// OFX file envelope
#include "file/oemimeheader.h"
#include "file/oefile.h"

// Message envelope and statements
#include "messages/oeaggregate.h"
#include "messages/oecurrency.h"
#include "messages/oeaccount.h"
#include "messages/oetrans.h"
#include "messages/oesignon.h"
#include "messages/oemsgset.h"
#include "messages/oebank.h"
#include "messages/oeprofile.h"
#include "messages/oestmtend.h"
#include "messages/oechallenge.h"
#include "messages/oeseclist.h"
#include "messages/oeopenorder.h"
#include "messages/oeinvest.h"

// Transport
#include "net/oenetacc.h"
#include "net/vrnacc.h"
#include "net/recvacc.h"

#endif
