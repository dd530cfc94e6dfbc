#include "net/line_reader.h"

#include <fcntl.h>
#include <unistd.h>

#include <array>
#include <boost/asio/error.hpp>
#include <boost/asio/post.hpp>
#include <cerrno>
#include <utility>

#include "bounds.h"

namespace raidsim {

using boost::system::error_code;

LineReader::LineReader(boost::asio::io_context& context, int descriptor, Use use)
    : input(context), onLine(std::move(use)) {
    error_code unusable;  // a closed descriptor is one that has ended
    input.assign(descriptor, unusable);
    if (unusable)
        return;
    flagsBefore = ::fcntl(descriptor, F_GETFL);
    wait();
}

LineReader::~LineReader() { stop(); }

void LineReader::stop() {
    if (!input.is_open())
        return;
    const int descriptor = input.release();
    ::fcntl(descriptor, F_SETFL, flagsBefore);
}

void LineReader::wait() {
    input.async_wait(boost::asio::posix::descriptor_base::wait_read, [this](error_code error) {
        if (error == boost::asio::error::operation_aborted)
            return;
        // Regular files cannot be waited for; they are always ready.
        if (!error || error == boost::asio::error::operation_not_supported)
            readOnce();
    });
}

void LineReader::readOnce() {
    std::array<char, 4096> chunk{};
    const ssize_t count = ::read(input.native_handle(), chunk.data(), chunk.size());
    if (count < 0 && (errno == EINTR || errno == EAGAIN)) {
        wait();
        return;
    }
    if (count <= 0) {
        pending += '\n';
        deliver();
        stop();
        return;
    }
    pending.append(chunk.data(), static_cast<std::size_t>(count));
    deliver();
    if (input.is_open())
        wait();
}

void LineReader::deliver() {
    std::size_t start = 0;
    for (auto end = pending.find('\n'); end != std::string::npos && input.is_open();
         end = pending.find('\n', start)) {
        if (!std::exchange(tooLong, false))
            onLine(std::string_view(pending).substr(start, end - start));
        start = end + 1;
    }
    pending.erase(0, start);
    if (pending.size() > bounds::controlLineBytes) {
        pending.clear();
        if (!std::exchange(tooLong, true))
            onLine(std::nullopt);
    }
}

}  // namespace raidsim
