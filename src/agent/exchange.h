#pragma once

/// One exchange with the RAID management service on 127.0.0.1:34572: connects, sends the
/// zero-terminated request, waits for the answer as long as it takes, and returns its body in a
/// malloc'ed buffer of Content-Length + 10 bytes, a zero byte behind it, which the caller frees.
/// Null when there is no connection or no usable answer, and when disconnectSocket ended the wait.
/// Prints one line on standard output. Throws nothing.
[[gnu::visibility("default")]] char* getSOAPData(const char* request);

/// The same with a stored request: 0 asks for the configuration, anything else for the event list.
[[gnu::visibility("default")]] char* getSOAPData(int which);

/// Sets endFlag: the exchange that is waiting gives up within one slice of 5 seconds. Any thread
/// may call it; an exchange that starts afterwards clears the flag again.
[[gnu::visibility("default")]] void disconnectSocket();
