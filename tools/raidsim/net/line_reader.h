#pragma once

#include <boost/asio/io_context.hpp>
#include <boost/asio/posix/stream_descriptor.hpp>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace raidsim {

// Delivers the lines of a descriptor, without their ends, until it ends; nothing in place of a
// line over bounds::controlLineBytes. The descriptor is not closed, and in the end is blocking
// again if it was: standard input is shared with other processes.
class LineReader {
public:
    using Use = std::function<void(std::optional<std::string_view> line)>;

    LineReader(boost::asio::io_context& context, int descriptor, Use use);
    ~LineReader();
    LineReader(const LineReader&) = delete;
    LineReader& operator=(const LineReader&) = delete;

    void stop();

private:
    void wait();
    void readOnce();
    void deliver();

    boost::asio::posix::stream_descriptor input;
    Use onLine;
    int flagsBefore = 0;
    std::string pending;
    bool tooLong = false;  // the rest of an overlong line is being passed over
};

}  // namespace raidsim
