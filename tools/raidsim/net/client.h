#pragma once

#include <functional>
#include <memory>

namespace raidsim {

// The service's side of one connection.
class Client {
public:
    using Closed = std::function<void(const std::shared_ptr<Client>&)>;

    Client() = default;
    Client(const Client&) = delete;
    Client& operator=(const Client&) = delete;
    virtual ~Client() = default;

    virtual void start() = 0;

    // Idempotent; whatever is under way is given up.
    virtual void close() = 0;

    // Closes so that the client meets a reset.
    virtual void reset() = 0;
};

}  // namespace raidsim
