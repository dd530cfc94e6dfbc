#include "running_service.h"

#include <chrono>
#include <stdexcept>

#include "control/command.h"

namespace raidsim::test {

namespace {

constexpr std::chrono::minutes patience{1};

ServerSettings onFreePort(ServerSettings settings) {
    settings.port = 0;
    return settings;
}

}  // namespace

std::string smallSystem() {
    return R"(<ac:system xmlns:ac="a" xmlns:as="b" xmlns:xsi="c" xsi:type="o:System">
  <as:overallStatus>0</as:overallStatus>
  <as:name>birch</as:name>
  <ac:adapter xsi:type="o:PellionAdapter">
    <as:overallStatus>0</as:overallStatus>
    <as:adapterID>1</as:adapterID>
    <ac:arrays>
      <as:overallStatus>0</as:overallStatus>
      <ac:basicArray>
        <as:overallStatus>0</as:overallStatus>
        <as:arrayID>7</as:arrayID>
        <ac:physicalDrives>
          <as:overallStatus>0</as:overallStatus>
          <ac:channel>
            <as:overallStatus>0</as:overallStatus>
            <as:channelID>1</as:channelID>
            <ac:hardDrive><as:overallStatus>0</as:overallStatus><as:state>1</as:state><as:deviceID>0</as:deviceID></ac:hardDrive>
          </ac:channel>
        </ac:physicalDrives>
      </ac:basicArray>
    </ac:arrays>
    <ac:hotSpareDrives>
      <as:overallStatus>0</as:overallStatus>
      <ac:hardDrive><as:overallStatus>0</as:overallStatus><as:state>2</as:state><as:deviceID>0</as:deviceID><as:channelID>2</as:channelID></ac:hardDrive>
    </ac:hotSpareDrives>
    <ac:physicalDrives>
      <as:overallStatus>0</as:overallStatus>
      <ac:channel>
        <as:overallStatus>0</as:overallStatus>
        <as:channelID>1</as:channelID>
        <ac:hardDrive><as:overallStatus>0</as:overallStatus><as:state>1</as:state><as:deviceID>0</as:deviceID><as:channelID>1</as:channelID><as:model>Q</as:model></ac:hardDrive>
      </ac:channel>
      <ac:channel>
        <as:overallStatus>0</as:overallStatus>
        <as:channelID>2</as:channelID>
        <ac:hardDrive><as:overallStatus>0</as:overallStatus><as:state>2</as:state><as:deviceID>0</as:deviceID><as:channelID>2</as:channelID><as:model>Q</as:model></ac:hardDrive>
      </ac:channel>
    </ac:physicalDrives>
  </ac:adapter>
</ac:system>
)";
}

Service makeService(const std::string& document, const std::string& path) {
    return Service(Document::parse(document), path,
                   [] { return std::chrono::sys_seconds(std::chrono::seconds(1'000'000'000)); });
}

RunningService::RunningService(ServerSettings settings, const std::string& document)
    : service(makeService(document)) {
    server.emplace(context, service, onFreePort(settings));
    listening = server->port();
    thread = std::thread([this] { serve(); });
}

RunningService::~RunningService() {
    onService([this] { server->stop(); });
    work.reset();
    thread.join();
}

// Counts anew after everything that may have changed a count.
void RunningService::serve() {
    while (context.run_one() > 0) {
        const std::lock_guard lock(mutex);
        counts = {service.events().waiting(), server->clients()};
        counted.notify_all();
    }
}

void RunningService::command(std::string_view line) {
    onService([&] { run(line, service); });
}

void RunningService::silence(RequestKind kind) {
    onService([&] { service.substitute(kind, std::nullopt); });
}

void RunningService::giveWaitersUp() {
    onService([this] { service.events().giveWaitersUp(); });
}

std::size_t RunningService::waiting() {
    return onService([this] { return service.events().waiting(); });
}

std::size_t RunningService::clients() {
    return onService([this] { return server->clients(); });
}

void RunningService::awaitWaiting(std::size_t count) {
    await(&Counts::waiting, count, "clients that wait for an event");
}

void RunningService::awaitClients(std::size_t count) { await(&Counts::clients, count, "clients"); }

void RunningService::await(std::size_t Counts::*which, std::size_t count, const char* what) {
    onService([] {});  // What was done before is counted.
    std::unique_lock lock(mutex);
    if (!counted.wait_for(lock, patience, [&] { return counts.*which == count; })) {
        throw std::runtime_error("there are " + std::to_string(counts.*which) + " in place of " +
                                 std::to_string(count) + ' ' + what);
    }
}

}  // namespace raidsim::test
