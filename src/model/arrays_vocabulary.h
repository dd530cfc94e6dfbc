#pragma once

#include "model/arrays.h"
#include "model/channels_and_drives_vocabulary.h"
#include "model/logical_drives_vocabulary.h"
#include "xml/element_reader.h"

// What the readers know of each element, row by row.

template <>
struct raid::xml::Vocabulary<RAIDBasicArray> {
    static constexpr Words<RAIDBasicArray> words{.element = "ac:basicArray",
                                                 .endWord = "basicArray",
                                                 .entry = "RAIDBasicArray Constructor\n",
                                                 .exit = "Exit RAIDSystem Constructor\n"};
    static constexpr auto type = &RAIDBasicArray::basicArrayType;
    static constexpr std::tuple children{
        flag("as:isSubArray", &RAIDBasicArray::isSubArray),
        number("as:type", &RAIDBasicArray::type),
        number("as:stripeSize", &RAIDBasicArray::stripeSize),
        number("as:overallStatus", &RAIDBasicArray::overallStatus),
        number("as:freeSpace", &RAIDBasicArray::freeSpace),
        text("as:preferredOwner", &RAIDBasicArray::preferredOwner),
        number("as:size", &RAIDBasicArray::size),
        text("as:name", &RAIDBasicArray::name),
        number("as:arrayID", &RAIDBasicArray::arrayID),
        one<&RAIDBasicArray::logicalDrives>("ac:logicalDrives"),
        one<&RAIDBasicArray::physicalDrives>("ac:physicalDrives"),
        each<&RAIDBasicArray::hardDrives>("ac:hardDrive"),
        number("as:adapterID", &RAIDBasicArray::adapterID),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDSpannedArray> {
    static constexpr Words<RAIDSpannedArray> words{.element = "ac:spannedArray",
                                                   .endWord = "spannedArray",
                                                   .entry = "RAIDSpannedArray Constructor\n",
                                                   .exit = "Exit RAIDSystem Constructor\n"};
    static constexpr auto type = &RAIDSpannedArray::spannedArrayType;
    // At this depth reading, copying and destroying fit in 512 KiB of stack in every build.
    static constexpr int nestingLimit = 256;
    static constexpr std::tuple children{
        number("as:type", &RAIDSpannedArray::type),
        number("as:stripeSize", &RAIDSpannedArray::stripeSize),
        number("as:overallStatus", &RAIDSpannedArray::overallStatus),
        number("as:freeSpace", &RAIDSpannedArray::freeSpace),
        text("as:preferredOwner", &RAIDSpannedArray::preferredOwner),
        number("as:size", &RAIDSpannedArray::size),
        text("as:name", &RAIDSpannedArray::name),
        number("as:arrayID", &RAIDSpannedArray::arrayID),
        one<&RAIDSpannedArray::logicalDrives>("ac:logicalDrives"),
        one<&RAIDSpannedArray::arrays>("ac:arrays"),
        number("as:adapterID", &RAIDSpannedArray::adapterID),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDArrays> {
    static constexpr Words<RAIDArrays> words{.element = "ac:arrays",
                                             .endWord = "arrays",
                                             .entry = "RAIDArrays Constructor\n",
                                             .exit = "Exit RAIDArrays Constructor\n"};
    static constexpr auto type = &RAIDArrays::arraysType;
    static constexpr std::tuple children{
        number("as:overallStatus", &RAIDArrays::overallStatus),
        each<&RAIDArrays::basicArray>("ac:basicArray"),
        each<&RAIDArrays::spannedArray>("ac:spannedArray"),
    };
};
