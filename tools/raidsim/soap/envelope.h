#pragma once

#include <string>

#include "xml/tree.h"

namespace raidsim::soap {

// An answer document: env:Envelope / env:Body / the response element, which takes over the content:
// a copy would double what a large system needs.
[[nodiscard]] xml::Tree envelope(const std::string& response, xml::Tree&& content);

// An answer with one return element, such as that of getNewestEvent.
[[nodiscard]] std::string returnValueBody(const std::string& response, int value);

enum class Blame { sender, receiver };

[[nodiscard]] std::string faultBody(Blame blame, const std::string& reason);

}  // namespace raidsim::soap
