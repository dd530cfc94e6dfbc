// Writes the words of a target's documents in the form that the fuzzer takes:
//
//   make_dictionary NAME > FILE

#include <iostream>
#include <set>
#include <string>

#include "model/classes.h"
#include "model/event_classes.h"

namespace {

using namespace raid::test;

class Dictionary {
public:
    void addElement(const std::string& name) {
        words.insert("<" + name + ">");
        words.insert("</" + name + ">");
        words.insert("<" + name + "/>");
    }

    void add(const std::vector<ModelClass>& classes) {
        for (const auto& model : classes) {
            addElement(model.element);
            for (const auto& field : model.fields) {
                addElement("as:" + field.name);
            }
            for (const auto& name : model.unshown) {
                addElement(name);
            }
        }
    }

    void write(std::ostream& out) const {
        for (const auto& word : words) {
            out << '"';
            for (const char c : word) {
                (c == '"' ? out << '\\' : out) << c;
            }
            out << "\"\n";
        }
    }

    void add(std::initializer_list<const char*> more) { words.insert(more.begin(), more.end()); }

private:
    std::set<std::string> words;
};

const std::initializer_list<const char*> markup{"<?xml version='1.0'?>",
                                                "<env:Envelope>",
                                                "</env:Envelope>",
                                                "<env:Body>",
                                                "</env:Body>",
                                                "xsi:type=",
                                                "='",
                                                "=\"",
                                                "/>",
                                                "</",
                                                "<!--",
                                                "-->",
                                                "<![CDATA[",
                                                "]]>",
                                                "<!DOCTYPE",
                                                "&lt;",
                                                "true",
                                                "false",
                                                "2147483648",
                                                "-2147483649",
                                                "%n",
                                                "%100$s",
                                                "\\x00",
                                                "\\xA0"};

const std::initializer_list<const char*> happenings{"silence\\x0A",
                                                    "signal\\x0A",
                                                    "reset\\x0A",
                                                    "disconnect\\x0A",
                                                    "piece 1\\x0A",
                                                    "piece 3023\\x0A",
                                                    "piece 3024\\x0A",
                                                    "\\x0A\\x0A",
                                                    "\\x0D\\x0A\\x0D\\x0A",
                                                    "HTTP/1.1 200 OK\\x0A",
                                                    "Content-Length: ",
                                                    "content-length: ",
                                                    "999999999",
                                                    "1234567890",
                                                    "-1"};

const std::initializer_list<const char*> settings{
    "LogLevel=",  "LogLevel",   "=",  "8\\x0A", "\\xEF\\xBB\\xBF", "#", ";", "[section]",
    "\\x0D\\x0A", "2147483648", "-1", "\\x00"};

const std::initializer_list<const char*> conversions{
    "%d",          "%5.3x", "%-08.2f", "%hhn", "%n",  "%s", "%100$s", "%*d", "%.*f",
    "%999999999d", "%%",    "%lc",     "%Lf",  "%'d", "%m", "%p",     "%a",  "%5%"};

bool fill(Dictionary& dictionary, const std::string& name) {
    if (name == "configuration") {
        dictionary.add(markup);
        dictionary.add(modelClasses());
        dictionary.add(passedClasses());
        dictionary.addElement("m:getConfigResponse");
        dictionary.add({"o:PellionAdapter", "o:MirrelAdapter", "o:DorvelAdapter", "o:LSIAdapter"});
    } else if (name == "events") {
        dictionary.add(markup);
        dictionary.add(eventClasses());
        dictionary.addElement("m:getEventsResponse");
        dictionary.addElement("m:getNewestEventResponse");
        dictionary.addElement("as:return");
    } else if (name == "answer") {
        dictionary.add(happenings);
    } else if (name == "settings") {
        dictionary.add(settings);
    } else if (name == "log_format") {
        dictionary.add(conversions);
    } else {
        return false;
    }
    return true;
}

}  // namespace

int main(int argc, char** argv) {
    Dictionary dictionary;
    if (argc != 2 || !fill(dictionary, argv[1])) {
        std::cerr << "usage: make_dictionary configuration|events|answer|settings|log_format\n";
        return 64;
    }
    dictionary.write(std::cout);
    return 0;
}
