#include "completion/completion.h"

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <map>
#include <string_view>

namespace completion {
namespace {

// In the scripts @PROGRAM@ and the like stand for what is made of the description.
constexpr std::string_view beginning =
    R"(# Completes the command line of @PROGRAM@; made by "@PROGRAM@ completion".
_@PROGRAM@() {
    local words=() listed=() word command= operand= place=0 type= offered= files=
    local prefix= current piece whole
    # The words as the program gets them: bash cuts them at "=" and ":", too.
    for word in "${COMP_WORDS[@]:0:COMP_CWORD+1}"; do
        if ((${#words[@]} > 0)) && [[ $word == [=:]* || ${words[-1]} == *[=:] ]]; then
            words[-1]+=$word
        else
            words+=("$word")
        fi
    done
    if [[ ${words[-1]} == --*=* ]]; then
        words=("${words[@]:0:${#words[@]}-1}" "${words[-1]%%=*}" "${words[-1]#*=}")
    fi
    # Where among the operands of which subcommand, or behind which option.
    for word in "${words[@]:1:${#words[@]}-2}"; do
        if [[ $type ]]; then
            type=
            continue
        fi
        case $word in
)";

constexpr std::string_view afterTypes = R"(            -*) ;;
            *)
                if [[ ! $command && " @SUBCOMMANDS@ " == *" $word "* ]]; then
                    command=$word operand= place=0
                else
                    operand=${operand:-$word} place=$((place + 1))
                fi
                ;;
        esac
    done
    if [[ ${words[-2]} == *[\<\>] ]]; then
        files=1 type=
    elif [[ ! $type ]]; then
        case $command in
)";

constexpr std::string_view afterOptions = R"(        esac
        case "$command $place" in
)";

// What bash cut off in front is no part of what it replaces.
constexpr std::string_view beforeValues = R"(        esac
    fi
    whole=${words[-1]#[\"\']} whole=${whole//\\/}
    piece=${COMP_WORDS[COMP_CWORD]#[\"\']} piece=${piece//\\/}
    [[ $piece != [=:]* ]] || piece=
    current=$whole
    case $type in
)";

constexpr std::string_view ending = R"(    esac
    mapfile -t COMPREPLY < <(compgen -W "$offered" -P "$prefix" -- "$current")
    if [[ $files ]]; then
        mapfile -t -O ${#COMPREPLY[@]} COMPREPLY < <(compgen -f -- "$current")
        compopt -o filenames 2>/dev/null
    fi
    COMPREPLY=("${COMPREPLY[@]#"${whole%"$piece"}"}")
}
complete -F _@PROGRAM@ @PROGRAM@
)";

// Words are taken as they were typed, even those that would be patterns of files.
constexpr std::string_view splitList =
    R"(            prefix=${current%"${current##*[,+]}"} current=${current##*[,+]}
            IFS=',+' read -ra listed <<<"$prefix"
            for word in "${listed[@]}"; do
                offered=" $offered " offered=${offered//" $word "/ }
            done
)";

constexpr std::string_view withoutBlank = R"(            compopt -o nospace 2>/dev/null
)";

std::string joined(const Words& words, const char* separator) {
    std::string text;
    for (const std::string& word : words)
        text += (text.empty() ? "" : separator) + word;
    return text;
}

std::string replaced(std::string_view text, std::string_view mark, const std::string& by) {
    std::string made(text);
    for (std::size_t at = 0; (at = made.find(mark, at)) != std::string::npos; at += by.size())
        made.replace(at, mark.size(), by);
    return made;
}

Words namesOf(const CLI::Option& option) {
    Words names;
    for (const std::string& name : option.get_snames())
        names.push_back("-" + name);
    for (const std::string& name : option.get_lnames())
        names.push_back("--" + name);
    return names;
}

std::vector<const CLI::App*> subcommandsOf(const CLI::App& app) {
    return app.get_subcommands([](const CLI::App*) { return true; });
}

Words subcommandNames(const CLI::App& app) {
    Words names;
    for (const CLI::App* const subcommand : subcommandsOf(app))
        names.push_back(subcommand->get_name());
    return names;
}

// The program itself, under no name, and its subcommands.
std::vector<std::pair<std::string, const CLI::App*>> commandsOf(const CLI::App& app) {
    std::vector<std::pair<std::string, const CLI::App*>> commands{{"", &app}};
    for (const CLI::App* const subcommand : subcommandsOf(app))
        commands.emplace_back(subcommand->get_name(), subcommand);
    return commands;
}

bool takesValue(const CLI::Option& option) { return option.get_items_expected_max() > 0; }

// One line for each type that an option's value may have.
std::string typeCases(const CLI::App& app) {
    std::map<std::string, Words> optionsOf;
    for (const auto& [name, command] : commandsOf(app)) {
        for (const CLI::Option* const option : command->get_options()) {
            if (takesValue(*option) && !option->get_positional()) {
                std::ranges::copy(namesOf(*option),
                                  std::back_inserter(optionsOf[option->get_type_name()]));
            }
        }
    }
    std::string cases;
    for (const auto& [type, options] : optionsOf)
        cases += "            " + joined(options, " | ") + ") type=\"" + type + "\" ;;\n";
    return cases;
}

std::string optionCases(const CLI::App& app) {
    std::string cases;
    for (const auto& [name, command] : commandsOf(app)) {
        Words words;
        const auto add = [&words](const CLI::App& from) {
            for (const CLI::Option* const option : from.get_options())
                std::ranges::copy(namesOf(*option), std::back_inserter(words));
        };
        add(*command);
        if (command != &app && command->get_fallthrough())
            add(app);
        std::ranges::sort(words);
        // clang 14 cannot compile the ranges' unique.
        words.erase(std::unique(words.begin(), words.end()), words.end());
        cases += "            \"" + name + "\") offered=\"" + joined(words, " ") + "\" ;;\n";
    }
    return cases;
}

// What may stand in each place; subcommands in the program's first.
std::string placeCases(const CLI::App& app) {
    std::string cases;
    for (const auto& [name, command] : commandsOf(app)) {
        Words types;
        for (const CLI::Option* const option : command->get_options()) {
            if (option->get_positional())
                types.push_back(option->get_type_name());
        }
        const bool choosesCommand = command == &app && !subcommandsOf(app).empty();
        const std::size_t places = std::max<std::size_t>(types.size(), choosesCommand ? 1 : 0);
        for (std::size_t place = 0; place < places; ++place) {
            cases += "            \"" + name + " " + std::to_string(place) + "\")";
            if (place == 0 && choosesCommand)
                cases += " offered+=\" " + joined(subcommandNames(app), " ") + "\"";
            if (place < types.size())
                cases += " type=\"" + types[place] + "\"";
            cases += " ;;\n";
        }
    }
    return cases;
}

std::string addition(const Words& words) { return "offered+=\" " + joined(words, " ") + "\""; }

std::string valueCases(const std::vector<Values>& all) {
    std::string cases;
    for (const Values& values : all) {
        cases += "        \"" + values.type + "\")\n";
        if (values.form == Form::file)
            cases += "            files=1\n";
        if (!values.wordsBehind.empty()) {
            cases += "            case $operand in\n";
            for (const auto& [operand, words] : values.wordsBehind)
                cases += "                " + operand + ") " + addition(words) + " ;;\n";
            cases += "                *) " + addition(values.words) + " ;;\n            esac\n";
        } else if (!values.words.empty()) {
            cases += "            " + addition(values.words) + "\n";
        }
        if (values.form == Form::list)
            cases += splitList;
        if (!values.alone.empty())
            cases += "            [[ $prefix ]] || " + addition(values.alone) + "\n";
        if (values.form == Form::start)
            cases += withoutBlank;
        cases += "            ;;\n";
    }
    return cases;
}

}  // namespace

std::string forBash(const CLI::App& app, const std::vector<Values>& values) {
    std::string script(beginning);
    script.append(typeCases(app)).append(afterTypes);
    script.append(optionCases(app)).append(afterOptions);
    script.append(placeCases(app)).append(beforeValues);
    script.append(valueCases(values)).append(ending);
    script = replaced(script, "@SUBCOMMANDS@", joined(subcommandNames(app), " "));
    return replaced(script, "@PROGRAM@", app.get_name());
}

}  // namespace completion
