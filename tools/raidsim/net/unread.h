#pragma once

#include <boost/asio/ip/tcp.hpp>

namespace raidsim {

// Whether the client, on this machine, has bytes of the connection that it has not yet taken from
// its socket. Looks into the kernel's table of connections: nothing tells of it unasked.
[[nodiscard]] bool clientHasUnread(boost::asio::ip::tcp::socket& socket);

}  // namespace raidsim
