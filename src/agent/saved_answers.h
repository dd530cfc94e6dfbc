#pragma once

#include <string>

/// Reads a saved configuration answer as if the service had sent it, without the lock. Returns 0;
/// a file that cannot be read changes nothing.
[[gnu::visibility("default")]] int readRAIDXML(std::string path);

/// The same for a saved events answer.
[[gnu::visibility("default")]] int readEventRAIDXML(std::string path);
