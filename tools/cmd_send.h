// The "send" command of the oesdk tool.
#ifndef OESDK_TOOLS_CMD_SEND_H
#define OESDK_TOOLS_CMD_SEND_H

// oesdk send URL REQUEST.ofx [--out REPLY.ofx] [--ca FILE] [--timeout S] [--log]
// argv holds the arguments after "send". Returns the process exit code: 0 when the reply came
// back and was saved, 1 when the exchange failed, 2 for a usage error. Registered with the
// tool in cmd_send_register.cpp.
int OESDKCommandSend(int argc, char** argv);

#endif
