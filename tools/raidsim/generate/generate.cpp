#include "generate/generate.h"

#include <random>
#include <utility>
#include <vector>

#include "state/event_log.h"

namespace raidsim::generate {

namespace {

// The standard fixes what mt19937 yields, but not what std::shuffle makes of it.
template <class Item>
void shuffle(std::vector<Item>& items, std::mt19937& random) {
    for (std::size_t left = items.size(); left > 1; --left)
        std::swap(items[left - 1], items[random() % left]);
}

// The attributes stay where they are, before all children.
void shuffleChildren(xml::Tree& element, std::mt19937& random) {
    std::vector<std::pair<std::string, xml::Tree>> children;
    for (auto child = element.begin(); child != element.end();) {
        if (child->first == xml::attributesKey) {
            ++child;
            continue;
        }
        shuffleChildren(child->second, random);
        children.emplace_back(child->first, xml::Tree()).second.swap(child->second);
        child = element.erase(child);
    }
    shuffle(children, random);
    for (auto& [name, child] : children)
        element.push_back({name, xml::Tree()})->second.swap(child);
}

xml::Tree eventsDocument(int count) {
    EventLog log(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i) {
        log.append({{"serverName", "rack-07"},
                    {"serverAddress", "127.0.0.1"},
                    {"date", "11/21/2026 10:00:00 UTC"},
                    {"string", "Drive is missing: adapter 1, channel 0, device " +
                                   std::to_string(i % 24) + " (Warning)"},
                    {"fru", "42D0520"},
                    {"eventCode", "404"},
                    {"type", "Warning"},
                    {"adapter", "1"},
                    {"channel", "0"},
                    {"deviceID", std::to_string(i % 24)}});
    }
    return xml::parse(log.body(1, count));
}

}  // namespace

std::string generate(const Order& order) {
    auto made = order.events ? eventsDocument(*order.events) : document(sizedRack(order.rack));
    if (order.shuffle) {
        std::mt19937 random(*order.shuffle);
        shuffleChildren(made, random);
    }
    return xml::format(made, order.layout);
}

}  // namespace raidsim::generate
