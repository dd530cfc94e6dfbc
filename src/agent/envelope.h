#pragma once

// The processors of answers: each walks the SOAP envelope and reads what is in it. They own the
// document, a malloc'ed buffer, and free it whatever happens; length is the bytes that they may
// read. A malformed document is logged at level 1. Exceptions other than RAIDXMLError pass through.

/// Replaces raidSystem by the configuration in the document, by null when there is none. Returns 0.
[[gnu::visibility("default")]] int processXML(char* document, int length);

/// Replaces raidEvents by the events in the document, by null when there are none. Returns 0.
[[gnu::visibility("default")]] int processEventXML(char* document, int length);

/// The number that a method returned; 0 when there is none.
[[nodiscard, gnu::visibility("default")]] int processReturnValueXML(char* document, int length);
