#pragma once

#include <gtest/gtest.h>

#include <string>

#include "xml/raid_xml_error.h"

namespace raid::test {

// Reads an element that is the whole text.
template <class Model>
Model read(const std::string& text) {
    int consumed = 0;
    Model model(text.data(), static_cast<int>(text.size()), &consumed);
    EXPECT_EQ(consumed, static_cast<int>(text.size()));
    return model;
}

template <class Model>
std::string errorOf(const std::string& text) {
    try {
        int consumed = 0;
        const Model model(text.data(), static_cast<int>(text.size()), &consumed);
        return "no error";
    } catch (const RAIDXMLError& error) {
        return error.getMessage();
    }
}

}  // namespace raid::test
