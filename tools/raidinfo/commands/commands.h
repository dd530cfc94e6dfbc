#pragma once

#include "command_line/options.h"
#include "commands/session.h"

namespace raidinfo {

// The subcommands. Each returns the program's exit status, or throws a Failure.

int runCommand(const Session& session, const ListOptions& list);
int runCommand(const Session& session, const ShowOptions& show);
int runCommand(const Session& session, const TreeOptions& tree);
int runCommand(const Session& session, const EventsOptions& events);
int runCommand(const Session& session, const WatchOptions& watch);
int runCommand(const Session& session, const HealthOptions& health);
int runCommand(const Session& session, const SnapshotOptions& snapshot);
int runCommand(const Session& session, const DiffOptions& diff);
int runCommand(const Session& session, const RecordOptions& record);
int runCommand(const Session& session, const DoctorOptions& doctor);

}  // namespace raidinfo
