# shellcheck shell=bash
# Which of the device's screens fits the display; sourced by ./run.

# lowest_mode FILE...: the lowest of the displays whose modes stand in these files, each with its best one first.
lowest_mode() {
    local modes
    for modes in "$@"; do
        sed -n '1s/^[0-9]*x\([0-9]*\).*/\1/p' "$modes" 2>/dev/null
    done | sort -n | head -n 1
}

# The display's height in pixels; nothing where nobody tells.
display_height() {
    if [[ -n ${DISPLAY:-} ]] && command -v xrandr >/dev/null; then
        xrandr --current 2>/dev/null | sed -n 's/^Screen 0:.* current [0-9]* x \([0-9]*\),.*/\1/p'
    elif [[ -n ${DISPLAY:-} ]] && command -v xdpyinfo >/dev/null; then
        xdpyinfo 2>/dev/null | sed -n 's/^ *dimensions: *[0-9]*x\([0-9]*\) .*/\1/p'
    else
        # The kernel names the modes of every connected display.
        lowest_mode /sys/class/drm/*/modes
    fi
}

# The larger screen takes a display with room for a title bar and a panel too; the smaller one fits any.
fitting_screen() {
    local height
    height=$(display_height)
    if ((${height:-0} >= 1400)); then
        printf '720x1280\n'
    else
        printf '480x800\n'
    fi
}
