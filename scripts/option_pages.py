#!/usr/bin/env python3
"""Makes a manual page or a shell's completion from the options of a program.

    option_pages.py LIST man TEMPLATE         LIST is what PROGRAM --option-list prints
    option_pages.py LIST bash|zsh|fish

The template of a manual page is a manual page with a part that the options take the place of:

    .\\" options
    .\\" --save
    More about that option, after what --help says.
    .\\" end

What completes a value are the words that the list names for it, else it hangs on its name: FILE is a
file, DIR a folder, words with "|" between them are those words, and all else is the user's."""
import json
import re
import sys

FOLDER, FILES, NOTHING = "DIR", "FILE", ""


RANGE = re.compile(r"(\w+):[A-Z]+ in \[(\S+) - (\S+)\]")


def names_of(option):
    return option.get("names", [])


def tidy(options):
    """Takes what is checked out of the names of values: "N:INT in [0 - 2]", "DIR:DIR"."""
    for option in options:
        bounds = RANGE.fullmatch(option.get("value", ""))
        if bounds:
            option["value"] = bounds.group(1)
            if "shown" not in option:  # which says it in its own words
                option["help"] += f", from {bounds.group(2)} to {bounds.group(3)}"
        elif option.get("value") == "DIR:DIR":
            option["value"] = FOLDER


def kind_of(option):
    """What completes the value: FILES, FOLDER, a list of words, or NOTHING."""
    value = option.get("value", "")
    if "argument" in option or value == FILES:
        return FILES
    if "words" in option:
        return option["words"]
    if "|" in value:
        return value.split("|")
    return FOLDER if value == FOLDER else NOTHING


def commands_of(program):
    """The commands of a program, itself under an empty name when it has none."""
    return program["commands"] or [{"name": "", "options": program["options"]}]


# Manual pages


def roff(text):
    text = text.replace("\\", "\\e").replace("-", "\\-")
    return "\\&" + text if text[:1] in (".", "'") else text


def sentence(text):
    """With a capital, but at the name of a command that the text is about, and a full stop."""
    return (text if re.match(r"[\w-]+:", text) else text[:1].upper() + text[1:]) + "."


def merged(program):
    """(option, names of its commands), each option once, in the order of the first command."""
    rows = {}
    for command in commands_of(program) + [{"name": "", "options": program["options"]}]:
        for option in command["options"]:
            key = tuple(names_of(option))
            commands = rows.setdefault(key, (option, []))[1] if key else []
            if command["name"]:
                commands.append(command["name"])
    return rows.values()


def manual(program, template):
    text = open(template, encoding="utf-8").read()
    begin, notes, end = re.split(r'(?ms)^\.\\" options\n(.*?)^\.\\" end\n', text)
    about = dict(re.findall(r'(?ms)^\.\\" (--\S+)\n(.*?)(?=^\.\\" |\Z)', notes))
    out = []
    for option, commands in merged(program):
        heading = ", ".join(f"\\fB{roff(name)}\\fR" for name in names_of(option))
        value = option.get("shown", option.get("value", ""))
        out.append(f".TP\n{heading}" + (f" \\fI{roff(value)}\\fR" if value else ""))
        few = "" if len(commands) in (0, len(program["commands"])) else ", ".join(commands) + ": "
        out.append(roff(sentence(few + option["help"])))
        note = next((about.pop(name) for name in names_of(option) if name in about), "")
        out += [note.rstrip("\n")] if note else []
    if about:
        sys.exit(f"{template}: no such options: {', '.join(about)}")
    return begin + "\n".join(out) + "\n" + end


# Shells


BASH = """# Completion of {program} for bash, made from its options.
_{program}()
{{
    local cur=${{COMP_WORDS[COMP_CWORD]}} prev=${{COMP_WORDS[COMP_CWORD - 1]}} words= kind= word
    # --option=value comes as three words.
    if [[ $cur == = ]]; then
        cur=
    elif [[ $prev == = ]]; then
        prev=${{COMP_WORDS[COMP_CWORD - 2]}}
    fi
    COMPREPLY=()
{command}    case $command:$prev in
{values}    esac
    if [[ -z $kind && $cur == -* ]]; then
        kind=words
        case $command in
{options}        esac
    fi
    case $kind in
        words) mapfile -t COMPREPLY < <(compgen -W "$words" -- "$cur") ;;
        folder) compopt -o filenames; mapfile -t COMPREPLY < <(compgen -d -- "$cur" 2>/dev/null) ;;
        none) ;;
        *) compopt -o filenames; mapfile -t COMPREPLY < <(compgen -f -- "$cur" 2>/dev/null) ;;
    esac
}}
complete -F _{program} {program}
"""
BASH_COMMAND = """    local command=
    for word in "${{COMP_WORDS[@]:1:COMP_CWORD - 1}}"; do
        case $word in {names}) command=$word; break ;; esac
    done
    [[ $command ]] || {{ kind=words words="{words}"; }}
"""


def bash(program):
    values, options = [], []
    for command in commands_of(program):
        name = command["name"]
        for option in command["options"]:
            if "value" not in option or "argument" in option:
                continue
            kind = kind_of(option)
            action = {FILES: "kind=files", FOLDER: "kind=folder", NOTHING: "kind=none"}.get(
                kind if isinstance(kind, str) else None,
                f"kind=words words='{' '.join(kind)}'")
            pattern = "|".join(f"{name}:{each}" for each in names_of(option))
            values.append(f"        {pattern}) {action} ;;\n")
        words = " ".join(each for option in command["options"] for each in names_of(option))
        options.append(f"            '{name}') words='{words}' ;;\n")
    names = [command["name"] for command in program["commands"]]
    own = [each for option in program["options"] for each in names_of(option)]
    head = "    local command=\n"
    if names:
        head = BASH_COMMAND.format(names="|".join(names), words=" ".join(names + own))
    return BASH.format(program=program["program"], command=head, values="".join(values),
                       options="".join(options))


def zsh_text(text):
    return re.sub(r"([\\:\[\]])", r"\\\1", text).replace("'", "'\\''")


def zsh_specs(options):
    for option in options:
        kind = kind_of(option)
        action = {FILES: "_files", FOLDER: "_files -/", NOTHING: " "}.get(
            kind if isinstance(kind, str) else None, f"({' '.join(kind)})")
        if "argument" in option:
            yield f"'*:{zsh_text(option['argument'])}:{action}'"
            continue
        value = option.get("value")
        takes = f":{zsh_text(value)}:{action}" if value is not None else ""
        for name in names_of(option):
            sign = "=" if value is not None and name.startswith("--") else ""
            yield f"'*{name}{sign}[{zsh_text(option['help'])}]{takes}'"


ZSH_COMMANDS = """local context state line
_arguments -C \\
    {own} \\
    '1:command:(({names}))' \\
    '*:: :->command' && return
case $words[1] in
{cases}esac
"""


def zsh(program):
    head = f"#compdef {program['program']}\n# Made from the options of {program['program']}.\n"
    glue = " \\\n    "
    if not program["commands"]:
        return head + "_arguments" + glue + glue.join(zsh_specs(program["options"])) + "\n"
    cases = "".join(f"{command['name']}) _arguments{glue}"
                    f"{glue.join(zsh_specs(command['options']))} ;;\n"
                    for command in program["commands"])
    names = " ".join(f'{command["name"]}\\:"{zsh_text(command["help"])}"'
                     for command in program["commands"])
    return head + ZSH_COMMANDS.format(own=glue.join(zsh_specs(program["options"])), names=names,
                                      cases=cases)


def fish_text(text):
    return "'" + text.replace("\\", "\\\\").replace("'", "\\'") + "'"


def fish(program):
    name = program["program"]
    lines = [f"# Completion of {name} for fish, made from its options."]
    for command in program["commands"]:
        lines.append(f"complete -c {name} -n __fish_use_subcommand -x -a {command['name']} "
                     f"-d {fish_text(command['help'])}")
    groups = [("", program["options"])] if not program["commands"] else [
        ("-n __fish_use_subcommand ", program["options"])] + [
        (f"-n '__fish_seen_subcommand_from {command['name']}' ", command["options"])
        for command in program["commands"]]
    for condition, options in groups:
        for option in options:
            if "argument" in option:
                continue
            kind = kind_of(option)
            takes = "" if "value" not in option else {
                FILES: " -r -F", FOLDER: " -x -a '(__fish_complete_directories)'", NOTHING: " -x"
            }.get(kind if isinstance(kind, str) else None, f" -x -a {fish_text(' '.join(kind))}")
            names = " ".join(f"-l {each[2:]}" if each.startswith("--") else f"-s {each[1:]}"
                             for each in names_of(option))
            lines.append(f"complete -c {name} {condition}{names}{takes} "
                         f"-d {fish_text(option['help'])}")
    return "\n".join(lines) + "\n"


def main():
    with open(sys.argv[1], encoding="utf-8") as file:
        program = json.load(file)
    for command in program["commands"] + [program]:
        tidy(command["options"])
    makers = {"man": lambda p: manual(p, sys.argv[3]), "bash": bash, "zsh": zsh, "fish": fish}
    sys.stdout.write(makers[sys.argv[2]](program))


if __name__ == "__main__":
    main()
