#include <CLI/CLI.hpp>
#include <algorithm>
#include <iterator>
#include <string>
#include <vector>

#include "command_line/description.h"
#include "command_line/options.h"

namespace raidinfo {
namespace {

std::string joined(const std::vector<std::string>& words, const char* separator) {
    std::string text;
    for (const std::string& word : words) {
        text += (text.empty() ? "" : separator) + word;
    }
    return text;
}

std::vector<std::string> namesOf(const CLI::Option& option) {
    std::vector<std::string> names;
    for (const std::string& name : option.get_snames()) {
        names.push_back("-" + name);
    }
    for (const std::string& name : option.get_lnames()) {
        names.push_back("--" + name);
    }
    return names;
}

/// The program itself and then its subcommands.
std::vector<const CLI::App*> withSubcommands(const CLI::App& app) {
    std::vector<const CLI::App*> apps{&app};
    std::ranges::copy(app.get_subcommands([](const CLI::App*) { return true; }),
                      std::back_inserter(apps));
    return apps;
}

std::vector<std::string> optionNames(const CLI::App& app) {
    std::vector<std::string> names;
    for (const CLI::Option* const option : app.get_options()) {
        std::ranges::copy(namesOf(*option), std::back_inserter(names));
    }
    return names;
}

/// The names of all options of an app and its subcommands that take a value of the type.
std::vector<std::string> optionsOfType(const std::vector<const CLI::App*>& apps,
                                       const std::string& type) {
    std::vector<std::string> names;
    for (const CLI::App* const app : apps) {
        for (const CLI::Option* const option : app->get_options()) {
            if (option->get_type_name() == type) {
                std::ranges::copy(namesOf(*option), std::back_inserter(names));
            }
        }
    }
    return names;
}

std::vector<std::string> kindKeys() {
    std::vector<std::string> keys;
    for (const Kind& kind : inventoryKinds()) {
        keys.emplace_back(kind.key);
    }
    return keys;
}

std::string columnCases() {
    std::string cases;
    for (const Kind& kind : inventoryKinds()) {
        std::vector<std::string> keys{"all"};
        for (const ListColumn& column : columnsOf(kind)) {
            keys.emplace_back(column.key);
        }
        cases += "                " + std::string{kind.key} + ") words=\"" + joined(keys, " ") +
                 "\" ;;\n";
    }
    return cases;
}

/// What may follow a subcommand: its options, those of the program, and kinds where it takes one.
std::string subcommandCases(const std::vector<const CLI::App*>& apps) {
    const std::vector<std::string> common = optionNames(*apps.front());
    std::string cases;
    for (const CLI::App* const app : apps) {
        std::vector<std::string> words = optionNames(*app);
        if (app == apps.front()) {
            for (const CLI::App* const subcommand : apps) {
                if (subcommand != app) {
                    words.push_back(subcommand->get_name());
                }
            }
        } else {
            words.insert(words.end(), common.begin(), common.end());
        }
        bool files = false;
        for (const CLI::Option* const option : app->get_options()) {
            if (option->get_positional() && option->get_type_name() == value_type::kind) {
                std::ranges::copy(kindKeys(), std::back_inserter(words));
            }
            files =
                files || (option->get_positional() && option->get_type_name() == value_type::file);
        }
        std::ranges::sort(words);
        // clang 14 cannot compile the ranges' unique.
        words.erase(std::unique(words.begin(), words.end()), words.end());
        cases += "        " + (app == apps.front() ? std::string{"\"\""} : app->get_name()) +
                 ") words=\"" + joined(words, " ") + "\"" + (files ? " files=1" : "") + " ;;\n";
    }
    return cases;
}

}  // namespace

std::string bashCompletion() {
    const Description description;
    const std::vector<const CLI::App*> apps = withSubcommands(description.app());
    std::vector<std::string> subcommands;
    for (const CLI::App* const app : apps) {
        if (app != apps.front()) {
            subcommands.push_back(app->get_name());
        }
    }
    return "# Completes the command line of raidinfo; made by \"raidinfo completion\".\n"
           "_raidinfo() {\n"
           "    local current=${COMP_WORDS[COMP_CWORD]} previous=${COMP_WORDS[COMP_CWORD - 1]}\n"
           "    local command= kind= words= files= prefix= word\n"
           "    COMPREPLY=()\n"
           "    for word in \"${COMP_WORDS[@]:1:COMP_CWORD-1}\"; do\n"
           "        case $word in\n"
           "            " +
           joined(subcommands, " | ") +
           ") command=${command:-$word} ;;\n"
           "            " +
           joined(kindKeys(), " | ") +
           ") kind=$word ;;\n"
           "        esac\n"
           "    done\n"
           "    case $previous in\n"
           "        " +
           joined(optionsOfType(apps, value_type::file), " | ") +
           ")\n"
           "            mapfile -t COMPREPLY < <(compgen -f -- \"$current\")\n"
           "            return ;;\n"
           "        " +
           joined(optionsOfType(apps, value_type::when), " | ") +
           ")\n"
           "            words=\"" +
           joined(colorChoices(), " ") +
           "\" command=value ;;\n"
           "        " +
           joined(optionsOfType(apps, value_type::columns), " | ") +
           ")\n"
           "            case $kind in\n" +
           columnCases() +
           "            esac\n"
           "            prefix=${current%\"${current##*[,+]}\"} current=${current##*[,+]} "
           "command=value ;;\n"
           "    esac\n"
           "    case $command in\n"
           "        value) ;;\n" +
           subcommandCases(apps) +
           "    esac\n"
           "    mapfile -t COMPREPLY < <(compgen ${files:+-f} -W \"$words\" -P \"$prefix\" -- "
           "\"$current\")\n"
           "}\n"
           "complete -o filenames -F _raidinfo raidinfo\n";
}

}  // namespace raidinfo
