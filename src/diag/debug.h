#pragma once

/// Appends the message to "../logs/RAIDInstrumentation.log" (relative to the host's working
/// directory) when level <= LOG_LEVEL; the first call in the process, whatever its level, reads
/// LOG_LEVEL from "../logs/RAIDInstrumentation.ini". The message is a format string without
/// arguments: "%%" prints one percent sign, a number conversion prints 0, and a conversion that
/// would touch memory is printed as it stands. A log that cannot be opened drops the message.
/// Any thread may call it.
[[gnu::visibility("default")]] void debug(int level, const char* message);
