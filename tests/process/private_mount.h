#pragma once

#include <string>

namespace raid::test {

// A file system in memory at a directory, for this process only; gone at the end of the scope.
// Throws where the kernel permits no mount.
class PrivateMount {
public:
    // The size is in bytes.
    PrivateMount(std::string directory, unsigned long size);
    PrivateMount(const PrivateMount&) = delete;
    PrivateMount& operator=(const PrivateMount&) = delete;
    ~PrivateMount();

    void makeReadOnly() const;

private:
    std::string path;
};

}  // namespace raid::test
