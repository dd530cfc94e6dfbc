#pragma once

#include "../model/raid_events.h"
#include "../model/system_and_adapter.h"

// What the library asks of the RAID management service. Nothing here reports a failure but
// getNewestEventRAIDXML: success shows in raidSystem or raidEvents. A failed exchange leaves them
// alone, a malformed answer leaves them null and its error in the log. Exceptions other than
// RAIDXMLError pass through.

/// The configuration and the event batch that were read last, or null. Owned by the library, which
/// deletes them when the next answer is read and when it is unloaded: keep no pointer into them.
[[gnu::visibility("default")]] extern RAIDSystem* raidSystem;
[[gnu::visibility("default")]] extern RAIDEvents* raidEvents;

[[nodiscard, gnu::visibility("default")]] RAIDSystem* getRAIDSystem();
[[nodiscard, gnu::visibility("default")]] RAIDEvents* getRAIDEvents();

/// Asks for the configuration and reads it, under mutex_handle. Returns 0.
[[gnu::visibility("default")]] int getRAIDXML();

/// Waits without limit for an event after the one before last, then reads the events from last to
/// last + 100. Returns 0, without the events when cancelEventRAIDXML was called meanwhile.
[[gnu::visibility("default")]] int getEventRAIDXML(int last);

/// The number of the newest event; -1 when there was no answer, 0 when it held no number.
[[nodiscard, gnu::visibility("default")]] int getNewestEventRAIDXML();

/// Ends the wait of getEventRAIDXML, from another thread, within one slice of 5 seconds.
[[gnu::visibility("default")]] void cancelEventRAIDXML();
