# shellcheck shell=bash
# Shared by the tests of the commands' scripts: tools that the test puts in the place of the machine's own.

folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
shell=$(command -v bash)
failures=0

# fresh_path TOOL...: a PATH with these of the machine's tools, and with those that stand_in puts there.
fresh_path() {
    local tool
    path=$(mktemp -d "$folder/path-XXXXXX")
    for tool in "$@"; do
        ln -s "$(command -v "$tool")" "$path/$tool"
    done
}

# stand_in NAME TEXT: a tool that prints TEXT.
stand_in() {
    stand_in_that "$1" "cat <<END
$2
END"
}

# stand_in_that NAME COMMANDS: a tool that does what the commands say.
stand_in_that() {
    printf '#!%s\n%s\n' "$shell" "$2" >"$path/$1"
    chmod a+rx "$path/$1"
}

# expect WHAT WANTED GOT
expect() {
    if [[ $2 != "$3" ]]; then
        printf '%s: "%s" was wanted, and it was "%s"\n' "$1" "$2" "$3"
        failures=$((failures + 1))
    fi
}
