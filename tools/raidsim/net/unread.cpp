#include "net/unread.h"

#include <linux/sockios.h>
#include <sys/ioctl.h>

#include <fstream>
#include <iomanip>
#include <sstream>
#include <string>

namespace raidsim {

namespace {

std::string ending(unsigned short port) {
    std::ostringstream out;
    out << ':' << std::uppercase << std::hex << std::setw(4) << std::setfill('0') << port;
    return out.str();
}

}  // namespace

bool clientHasUnread(boost::asio::ip::tcp::socket& socket) {
    boost::system::error_code error;
    const auto client = socket.remote_endpoint(error);
    int unsent = 0;
    if (error || ioctl(socket.native_handle(), SIOCOUTQ, &unsent) < 0)
        return false;
    if (unsent > 0)
        return true;
    const std::string local = ending(client.port());
    const std::string remote = ending(socket.local_endpoint().port());
    std::ifstream table("/proc/thread-self/net/tcp");
    std::string slot;
    std::string from;
    std::string to;
    std::string state;
    std::string queues;  // "sent:received", in hexadecimal
    for (std::string rest;
         table >> slot >> from >> to >> state >> queues && getline(table, rest);) {
        if (from.ends_with(local) && to.ends_with(remote))
            return queues.substr(queues.find(':') + 1).find_first_not_of('0') != std::string::npos;
    }
    return false;
}

}  // namespace raidsim
