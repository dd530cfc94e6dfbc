#include "support/state_machine.h"

namespace raid::fuzz {
namespace {

constexpr int done = 99;

bool isSpaceCharacter(char character) {
    const auto c = static_cast<unsigned char>(character);
    return c <= 32 || (c >= 127 && c <= 160) || c == 255;
}

class StateMachine {
public:
    explicit StateMachine(DescribedUnit& filled) : unit(filled) {}

    void run(std::string_view text) {
        for (index = 0; state != done && index < static_cast<int>(text.size()); ++index) {
            const char c = text[static_cast<std::size_t>(index)];
            unit.trace.push_back("state " + std::to_string(state) + ", char " + c);
            handle(c);
        }
    }

private:
    void handle(char c) {
        switch (state) {
            case 0:
                beforeUnit(c);
                break;
            case 1:
                c == '<' ? endText() : buffer.push_back(c);
                break;
            case 2:
                afterOpen(c);
                break;
            case 3:
                elementName(c);
                break;
            case 4:
                insideTag(c);
                break;
            case 5:
                attributeName(c);
                break;
            case 6:
                state = c == '=' ? 7 : 6;
                break;
            case 7:
                afterEquals(c);
                break;
            case 8:
                value(c, '"');
                break;
            case 9:
                value(c, '\'');
                break;
            case 10:
                endTagAt(c);
                break;
            default:
                break;
        }
    }

    void beforeUnit(char c) {
        if (isSpaceCharacter(c)) {
            return;
        }
        unit.kind = c == '<' ? 1 : 0;
        state = c == '<' ? 2 : 1;
        if (c != '<') {
            buffer = c;
        }
    }

    void endText() {
        while (!buffer.empty() && isSpaceCharacter(buffer.back())) {
            buffer.pop_back();
        }
        while (!buffer.empty() && isSpaceCharacter(buffer.front())) {
            buffer.erase(0, 1);
        }
        unit.name = buffer;
        unit.trace.push_back("CDATA " + unit.name);
        unit.consumed = index;
        state = done;
    }

    void afterOpen(char c) {
        if (isSpaceCharacter(c)) {
            return;
        }
        if (c == '/') {
            unit.closing = true;
            buffer.clear();
        } else {
            unit.opening = true;
            buffer = c;
        }
        state = 3;
    }

    void elementName(char c) {
        if (c != '/' && c != '>' && !isSpaceCharacter(c)) {
            buffer.push_back(c);
            return;
        }
        unit.name = buffer;
        unit.trace.push_back("element " + unit.name);
        if (c == '/') {
            unit.closing = true;
            state = 10;
        } else if (c == '>') {
            endTagAt(c);
        } else {
            state = 4;
        }
    }

    void insideTag(char c) {
        if (isSpaceCharacter(c)) {
            return;
        }
        if (c == '/') {
            unit.closing = true;
            state = 10;
        } else if (c == '>') {
            endTagAt(c);
        } else if (c == '?') {
            state = 10;
        } else {
            attribute = c;
            state = 5;
        }
    }

    void attributeName(char c) {
        if (isSpaceCharacter(c)) {
            state = 6;
        } else if (c == '=') {
            state = 7;
        } else {
            attribute.push_back(c);
        }
    }

    void afterEquals(char c) {
        if (c == '"' || c == '\'') {
            buffer.clear();
            state = c == '"' ? 8 : 9;
        }
    }

    void value(char c, char quote) {
        if (c != quote) {
            buffer.push_back(c);
            return;
        }
        unit.attributes.emplace_back(attribute, buffer);
        unit.trace.push_back("Attribute: " + attribute + "=" + buffer);
        state = 4;
    }

    void endTagAt(char c) {
        if (c == '>') {
            unit.consumed = index + 1;
            state = done;
        }
    }

    DescribedUnit& unit;
    int state = 0;
    int index = 0;
    std::string buffer;
    std::string attribute;
};

}  // namespace

DescribedUnit describedUnit(std::string_view text) {
    DescribedUnit unit;
    StateMachine(unit).run(text);
    return unit;
}

}  // namespace raid::fuzz
