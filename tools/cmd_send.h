// The "send" command of the oesdk tool.
#ifndef OESDK_TOOLS_CMD_SEND_H
#define OESDK_TOOLS_CMD_SEND_H

// oesdk send URL REQUEST.ofx [--out REPLY.ofx] [--ca FILE] [--timeout S] [--log]
// argv holds the arguments after "send". Returns the process exit code: 0 when the reply came
// back and was saved, 1 when the exchange failed, 2 for a usage error.
int OESDKCommandSend(int argc, char** argv);

// Usage lines for the tool's help text.
extern const char kOESDKSendUsage[];

#endif
