#pragma once

#include <boost/asio/executor_work_guard.hpp>
#include <boost/asio/io_context.hpp>
#include <boost/asio/post.hpp>
#include <condition_variable>
#include <cstddef>
#include <future>
#include <mutex>
#include <optional>
#include <string>
#include <string_view>
#include <thread>

#include "net/server.h"
#include "service.h"

namespace raidsim::test {

// A configuration with one adapter of two drives, one of them in an array, the other a spare.
[[nodiscard]] std::string smallSystem();

// The clock of this service stands still at 2001-09-09T01:46:40Z.
[[nodiscard]] Service makeService(const std::string& document, const std::string& path = "none");

// A service that answers on a free port from a thread of its own.
class RunningService {
public:
    explicit RunningService(ServerSettings settings = {},
                            const std::string& document = smallSystem());
    ~RunningService();
    RunningService(const RunningService&) = delete;
    RunningService& operator=(const RunningService&) = delete;

    [[nodiscard]] std::uint16_t port() const noexcept { return listening; }

    // Runs on the service's thread.
    void command(std::string_view line);
    void silence(RequestKind kind);
    void giveWaitersUp();
    [[nodiscard]] std::size_t waiting();
    [[nodiscard]] std::size_t clients();

    // Throw std::runtime_error when it is not so within a minute.
    void awaitWaiting(std::size_t count);
    void awaitClients(std::size_t count);

private:
    struct Counts {
        std::size_t waiting = 0;
        std::size_t clients = 0;
    };

    void serve();
    void await(std::size_t Counts::*which, std::size_t count, const char* what);

    template <typename Action>
    auto onService(Action action) {
        std::packaged_task<decltype(action())()> task(std::move(action));
        auto result = task.get_future();
        boost::asio::post(context, [&task] { task(); });
        return result.get();
    }

    boost::asio::io_context context{1};
    // Without it the thread would end when nobody listens.
    std::optional<boost::asio::executor_work_guard<boost::asio::io_context::executor_type>> work{
        context.get_executor()};
    Service service;
    std::optional<Server> server;
    std::uint16_t listening;
    std::mutex mutex;
    std::condition_variable counted;
    Counts counts;
    std::thread thread;
};

}  // namespace raidsim::test
