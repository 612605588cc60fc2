# A virtual display, and a program on it that is watched, typed to and photographed. Sourced by scripts that walk
# through the client; they set $log, the client's output, and $pictures, a folder.

say() { printf '== %s\n' "$*"; }

# start_display WIDTHxHEIGHT
start_display() {
    display_file=$(mktemp)
    exec 9>"$display_file"
    Xvfb -displayfd 9 -screen 0 "$1x24" -nolisten tcp >/dev/null 2>&1 &
    for _ in $(seq 100); do
        [ -s "$display_file" ] && break
        sleep 0.1
    done
    DISPLAY=:$(cat "$display_file")
    export DISPLAY
    openbox >/dev/null 2>&1 &
}

stop_display() {
    # shellcheck disable=SC2046
    kill $(jobs -p) 2>/dev/null || true
    rm -f "${display_file:-}"
}

# Waits until a line stands in the client's output, a given number of times.
await() {
    local text=$1 times=${2:-1}
    for _ in $(seq "${patience:-300}"); do
        [ "$(grep -cF "$text" "$log" 2>/dev/null || true)" -ge "$times" ] && return 0
        sleep 0.1
    done
    picture failed
    echo "The client did not get as far as: $text" >&2
    exit 1
}

await_window() {
    local end=$((SECONDS + ${patience:-300} / 10))
    # A window that goes while it is looked at ends the search, so it begins again.
    until xdotool search --onlyvisible --name "$1" >/dev/null 2>&1; do
        [ "$SECONDS" -lt "$end" ] || { picture failed; echo "No window with the title: $1" >&2; exit 1; }
        sleep 0.2
    done
    # The window manager still has to hand the focus over.
    sleep 1
}

picture() {
    import -window root "$pictures/$1.png"
    say "picture $pictures/$1.png"
}

keys() { xdotool key --clearmodifiers "$@"; }
