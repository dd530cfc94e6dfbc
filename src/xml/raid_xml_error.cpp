#include "xml/raid_xml_error.h"

#include <utility>

RAIDXMLError::RAIDXMLError(std::string text) : message(std::move(text)) {}
RAIDXMLError::RAIDXMLError(const RAIDXMLError&) = default;
RAIDXMLError& RAIDXMLError::operator=(const RAIDXMLError&) = default;
RAIDXMLError::~RAIDXMLError() = default;

std::string RAIDXMLError::getMessage() const { return "XML syntax error: " + message; }

// Callers outside were built with strings passed by value.
// NOLINTNEXTLINE(performance-unnecessary-value-param)
void processException(std::string context, std::string detail, RAIDXMLError& error) {
    error.message.append("\n").append(context).append(":").append(detail).append("\n");
    throw;
}
