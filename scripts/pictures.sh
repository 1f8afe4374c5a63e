# shellcheck shell=bash
# Shared by the commands that take the pictures below docs/images, which source it after scripts/common.sh.

# shellcheck disable=SC2034
screens=(720x1280 480x800)
# shellcheck disable=SC2034
mapfile -t languages < <(basename -a res/locale/*/)

# own_device [BUILD FOLDER]: has $tool run a device of its own, so that one that runs is left alone. It and $scratch,
# a folder for what lies about, go when the command ends.
own_device() {
    tool=${1:-build/dev}/bin/kest-device
    [[ -x $tool ]] || fail "there is no $tool; ./run builds it."
    scratch=$(mktemp -d)
    export KEST_DEVICE=$scratch/device
    unset DBUS_SESSION_BUS_ADDRESS DISPLAY WAYLAND_DISPLAY
    trap '"$tool" stop >/dev/null 2>&1 || true; rm -rf "$scratch"' EXIT
    mkdir -p docs/images
}

# ending SCREEN THEME: what the names of pictures of that screen and theme end in.
ending() {
    if [[ $1 == 480x800 ]]; then
        printf -- '-%s-small.png' "$2"
    else
        printf -- '-%s.png' "$2"
    fi
}
