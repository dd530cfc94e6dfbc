#pragma once

#include "model/raid_events.h"
#include "xml/element_reader.h"

// What the readers know of each element, row by row.

template <>
struct raid::xml::Vocabulary<RAIDEvent> {
    static constexpr Words<RAIDEvent> words{.element = "ac:event",
                                            .endWord = "Event",
                                            .entry = "RAIDEvent Constructor\n",
                                            .exit = "Exit RAIDEvent Constructor\n"};
    static constexpr auto type = &RAIDEvent::eventType;
    static constexpr std::tuple children{
        text("as:serverName", &RAIDEvent::serverName),
        text("as:serverAddress", &RAIDEvent::serverAddress),
        text("as:date", &RAIDEvent::date),
        text("as:string", &RAIDEvent::messageString),
        text("as:fru", &RAIDEvent::fru),
        number("as:sequenceNumber", &RAIDEvent::sequenceNumber),
        number("as:eventCode", &RAIDEvent::eventCode),
        text("as:type", &RAIDEvent::type),
        number("as:adapter", &RAIDEvent::adapter),
        number("as:logicalDrive", &RAIDEvent::logicalDrive),
        number("as:channel", &RAIDEvent::channel),
        number("as:deviceID", &RAIDEvent::deviceID),
        number("as:enclosureID", &RAIDEvent::enclosureID),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDEvents> {
    static constexpr Words<RAIDEvents> words{.element = "ac:events",
                                             .endWord = "Events",
                                             .entry = "RAIDEvents Constructor\n",
                                             .exit = "Exit RAIDEvents Constructor\n"};
    static constexpr auto type = &RAIDEvents::eventsType;
    static constexpr std::tuple children{
        each<&RAIDEvents::events>("ac:event"),
    };
};
