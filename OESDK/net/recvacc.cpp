// Manual exchange through SEND.DAT and RECV.DAT.
#include "net/recvacc.h"

#include "foundation/oememory.h"
#include "platform/oeplatform.h"

#include <cstdio>
#include <cstring>
#include <string>

namespace {
const char kModule[] = "recvacc";
const unsigned long kBlock = 10000;
} // namespace

const char* const ReceiverRequest::kPrompt[4] = {
    "Go to the directory that contains LDW.INI. ",
    "There you will find a SEND.DAT file containing your requests.\n\n",
    "If you wish to continue, copy or create a RECV.DAT file and press YES.\n",
    "If you wish to cancel, press NO."};

ReceiverRequest::ReceiverRequest() : m_access(nullptr), m_replySize(0), m_body(nullptr) {
    m_replyFile[0] = '\0';
}

ReceiverRequest::~ReceiverRequest() {}

void ReceiverRequest::BuildFileSpec(const char* name, char* out) {
    std::snprintf(out, 1024, "%s", name);
}

int ReceiverRequest::RRYesNoMsg(const char*) {
    return 0;
}

OENetStatus ReceiverRequest::Send(const OEString& url, OEBuffer* body) {
    m_body = body;
    char path[1024];
    path[0] = '\0';
    BuildFileSpec("SEND.DAT", path);
    std::FILE* f = _LDfopen(path, "wb");
    if (!f) {
        Util::GetOps().Message(1, 0, kModule, __LINE__, "ReceiverRequest::Send", "cannot write %s", path);
        return OENetOpenFailed;
    }
    bool written = true;
    if (body && body->GetBufferPtr()) {
        body->SetBufferOffset(0);
        unsigned long size = body->GetBufferSize();
        while (body->GetBufferOffset() < size) {
            unsigned long at = body->GetBufferOffset();
            unsigned long n = size - at < kBlock ? size - at : kBlock;
            if (std::fwrite(body->GetBufferPtr() + at, 1, n, f) != n) written = false;
            body->SetBufferOffset(at + n);
        }
    }
    if (std::fclose(f) != 0 || !written) {
        Util::GetOps().Message(1, 0, kModule, __LINE__, "ReceiverRequest::Send", "cannot write %s", path);
        return OENetOpenFailed;
    }
    std::string prompt;
    for (const char* piece : kPrompt) prompt += piece;
    if (!RRYesNoMsg(prompt.c_str())) return OENetOpenFailed;
    return Get(url);
}

OENetStatus ReceiverRequest::Get(const OEString& url) {
    m_url = url;
    m_replyFile[0] = '\0';
    m_replySize = 0;
    BuildFileSpec("RECV.DAT", m_replyFile);
    OEFileStat st;
    if (_LD_stat(m_replyFile, &st) == 0 && !st.isDirectory)
        m_replySize = st.size > 0xFFFFFFFFll ? 0xFFFFFFFFu : static_cast<std::uint32_t>(st.size);
    return OENetOK;
}

OENetStatus ReceiverRequest::LoadReply(OEBuffer* buffer) {
    if (!buffer || m_replySize == 0) return OENetReplyLoadFailed;
    if (!AppendFileInBlocks(m_replyFile, buffer)) {
        Util::GetOps().Message(1, 0, kModule, __LINE__, "ReceiverRequest::LoadReply", "cannot open %s",
                               m_replyFile);
        return OENetReplyLoadFailed;
    }
    return buffer->GetBufferSize() == m_replySize ? OENetOK : OENetReplyLoadFailed;
}

OENetStatus ReceiverRequest::GetReplySize(unsigned long* size) {
    if (m_replySize == 0) return OENetReplySizeFailed;
    if (size) *size = m_replySize;
    return OENetOK;
}

OENetRequest* ReceiverAccess::NewNetRequest() {
    ReceiverRequest* r = OEMemory::New<ReceiverRequest>();
    if (r) r->SetAccess(this);
    return r;
}
