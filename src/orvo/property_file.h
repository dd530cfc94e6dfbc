#pragma once

#include <map>
#include <string>
#include <utility>

// The stand-in for the maker's common library: just what reading one settings file takes.
namespace Orvo {

[[nodiscard]] std::wstring make_wstring(const std::string& narrow);
[[nodiscard]] std::string make_string(const std::wstring& wide);

namespace File {

class Path {
public:
    explicit Path(std::string text) : name(std::move(text)) {}
    [[nodiscard]] const std::string& string() const noexcept { return name; }

private:
    std::string name;
};

}  // namespace File

/// A text file of "key=value" lines. Blanks around key and value, comment lines ("#", ";"),
/// "[section]" lines, CR LF line ends and a UTF-8 byte-order mark are passed over; the last value
/// of a key holds.
class PropertyFile {
public:
    /// The largest file that open reads.
    static constexpr std::size_t sizeLimit = 1024 * 1024;

    explicit PropertyFile(File::Path file) : path(std::move(file)) {}

    /// Reads the file whole. Throws std::runtime_error for a file that is missing, unreadable,
    /// not a regular file or over the size limit. The mode is accepted for the interface's sake;
    /// the file is only ever read.
    void open(int mode);

    /// Throws std::out_of_range for a key that the file does not have.
    [[nodiscard]] const std::wstring& getValue(const std::wstring& key) const;

    void close() noexcept { values.clear(); }

private:
    File::Path path;
    std::map<std::wstring, std::wstring> values;
};

}  // namespace Orvo
