#pragma once

#include "support/scripted_service.h"

// The service that answers as a test says, under the names of these tests.
namespace raidinfo::test {

using raid::test::answering;
using raid::test::Connection;
using raid::test::End;
using raid::test::newestEventDocument;
using raid::test::ScriptedService;
using raid::test::Stage;

}  // namespace raidinfo::test
