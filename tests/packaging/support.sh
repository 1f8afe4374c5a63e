# shellcheck shell=bash
# Shared by the tests here, which source it with the project's root as current folder. Their first word is the folder of
# the build.
build=$(realpath "$1")
failures=0

# expect WHAT WANTED GOT: says both where they differ.
expect() {
    if [[ $2 != "$3" ]]; then
        printf '%s: this was wanted:\n%s\nand it was:\n%s\n' "$1" "$2" "$3"
        failures=$((failures + 1))
    fi
}

# expect_clean COMMAND...: it succeeds and says nothing of a mistake.
expect_clean() {
    local words
    if ! words=$("$@" 2>&1); then
        printf '%s:\n%s\n' "$*" "$words"
        failures=$((failures + 1))
    fi
}

# skip WHY: ends a test that cannot run here.
skip() {
    printf 'skipped: %s\n' "$1"
    exit 77
}

finish() {
    exit "$((failures > 0))"
}

# help_of [COMMAND...]: what the tool says, of itself or of a command.
help_of() {
    "$build/bin/kest-device" "$@" --help
}

# commands [COMMAND]: the tool's commands, or those of a command, one a line, as its help lists them.
commands() {
    help_of "$@" | sed -n '/^\(Commands\|Subcommands\):$/,/^$/s/^  \([a-z-]*\) .*/\1/p'
}

# The tool's commands and those of its commands: one a line, all its words.
all_commands() {
    local command inner
    for command in $(commands); do
        printf '%s\n' "$command"
        for inner in $(commands "$command"); do
            printf '%s\n' "$command $inner"
        done
    done
}
