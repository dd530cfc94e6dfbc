#pragma once

#include <string>

class RAIDXMLError;

/// Appends "\n" context ":" detail "\n" to the error's message and rethrows the exception being
/// handled, which must be that error.
[[noreturn, gnu::visibility("default")]] void processException(std::string context,
                                                               std::string detail,
                                                               RAIDXMLError& error);

/// Thrown when an agent document is malformed.
class [[gnu::visibility("default")]] RAIDXMLError {
public:
    explicit RAIDXMLError(std::string text);
    RAIDXMLError(const RAIDXMLError&);
    RAIDXMLError& operator=(const RAIDXMLError&);
    ~RAIDXMLError();

    /// "XML syntax error: ", then the message: what was wrong, then one line for each element
    /// around it, the innermost first.
    [[nodiscard]] std::string getMessage() const;

private:
    friend void processException(std::string context, std::string detail, RAIDXMLError & error);

    std::string message;
};
