#!/usr/bin/env bash
# Start-up and memory on real X11 windows (Xvfb and openbox) of the bare
# Elementary window, the widget (4x2 and 4x4 over ten cities), the Xfce
# panel with its weather plugin and GNOME Weather, each started the same
# way, RUNS times in turn after one discarded warm-up round.
#   start-up: process start until its first window is mapped (xdotool);
#   memory:   RSS and PSS of the process and its children, SETTLE seconds
#             after that (the widget also waits for its host to be idle).
# Appends one line per figure to RESULTS:
#   x11 <subject> <metric> <median> <unit> <samples> <values>
# and "# <subject>: ..." for a subject that could not be run. BENCH_SUBJECTS
# names some of the subjects, BENCH_SETTLE the seconds to settle (3).
# Run it inside a session bus: scripts/bench-compare does.
# usage: bench/x11-measure.sh BUILD_DIR RESULTS RUNS
set -euo pipefail
build_dir=$1
results=$2
runs=$3
settle=${BENCH_SETTLE:-3}
cd "$(dirname "$0")/.."

# One private home for every program started here, the session bus and the
# services it starts included: they take their environment from the bus.
if [ -z "${BENCH_X11_WORK:-}" ]; then
    BENCH_X11_WORK=$(mktemp -d /tmp/weather-bench-x11.XXXXXX)
    export BENCH_X11_WORK HOME=$BENCH_X11_WORK/home
    export XDG_CONFIG_HOME=$HOME/.config XDG_CACHE_HOME=$HOME/.cache XDG_DATA_HOME=$HOME/.local/share
    mkdir -p "$XDG_CONFIG_HOME" "$XDG_CACHE_HOME" "$XDG_DATA_HOME"
    status=0
    dbus-run-session -- "$0" "$@" || status=$?
    rm -rf "$BENCH_X11_WORK"
    exit $status
fi
work=$BENCH_X11_WORK

. scripts/lib/widget-host.sh
host_use_build "$build_dir"
bare=$build/bench/BareWindow
server_pid=
wm_pid=
pid=
cleanup() {
    [ -z "$pid" ] || stop_subject
    [ -z "$wm_pid" ] || kill "$wm_pid" 2> /dev/null || true
    [ -z "$server_pid" ] || kill "$server_pid" 2> /dev/null || true
    # shellcheck disable=SC2046 # a list of pids
    [ ! -s "$work/services" ] || kill $(sort -u "$work/services") 2> /dev/null || true
    wait 2> /dev/null || true
}
trap cleanup EXIT
trap 'exit 130' INT TERM

# A display of our own: the first free number from 90 on.
display=90
while [ -e "/tmp/.X$display-lock" ] || [ -e "/tmp/.X11-unix/X$display" ]; do display=$((display + 1)); done
Xvfb ":$display" -screen 0 1280x1024x24 -nolisten tcp > "$work/xvfb.log" 2>&1 &
server_pid=$!
export DISPLAY=:$display
unset WAYLAND_DISPLAY
for _ in $(seq 100); do xdpyinfo > /dev/null 2>&1 && break; sleep 0.1; done
openbox --sm-disable > "$work/openbox.log" 2>&1 &
wm_pid=$!
for _ in $(seq 100); do xprop -root _NET_SUPPORTING_WM_CHECK 2> /dev/null | grep -q window && break; sleep 0.1; done

mkdir -p "$XDG_CONFIG_HOME/xfce4/xfconf/xfce-perchannel-xml" "$XDG_CONFIG_HOME/xfce4/panel"
# One panel along the top holding only the weather plugin, set on Seoul.
cat > "$XDG_CONFIG_HOME/xfce4/xfconf/xfce-perchannel-xml/xfce4-panel.xml" << 'XML'
<?xml version="1.0" encoding="UTF-8"?>
<channel name="xfce4-panel" version="1.0">
  <property name="configver" type="int" value="2"/>
  <property name="panels" type="array">
    <value type="int" value="1"/>
    <property name="panel-1" type="empty">
      <property name="position" type="string" value="p=6;x=0;y=0"/>
      <property name="length" type="uint" value="100"/>
      <property name="position-locked" type="bool" value="true"/>
      <property name="size" type="uint" value="30"/>
      <property name="plugin-ids" type="array">
        <value type="int" value="1"/>
      </property>
    </property>
  </property>
  <property name="plugins" type="empty">
    <property name="plugin-1" type="string" value="weather"/>
  </property>
</channel>
XML
printf 'loc_name=Seoul\nlat=37.566\nlon=126.978\nmsl=38\ntimezone=Asia/Seoul\n' \
    > "$XDG_CONFIG_HOME/xfce4/panel/weather-1.rc"

read -r -a subjects <<< "${BENCH_SUBJECTS:-floor widget xfce4-panel gnome-weather}"

# The widget's root: ten cities through the weather app, weather from the agent.
if [[ " ${subjects[*]} " == *" widget "* ]]; then
    host_new_root "$work/root" --widget "$widget" --agent "$agent" --app "$app"
    for city in seoul london "new york" sydney tokyo paris cairo "mexico city" mumbai "buenos aires"; do
        "$app" add "$city" > /dev/null
    done
    "$agent" refresh > /dev/null
fi
mkfifo "$work/stay"
exec 7<> "$work/stay"

declare -A why_not
command -v xfce4-panel > /dev/null || why_not[xfce4-panel]="xfce4-panel is not installed"
[ -e /usr/share/xfce4/panel/plugins/weather.desktop ] ||
    why_not[xfce4-panel]="xfce4-weather-plugin is not installed"
command -v gnome-weather > /dev/null || why_not[gnome-weather]="gnome-weather is not installed"

start_subject() {
    case $1 in
        floor) "$bare" --stay <&7 > /dev/null 2>&1 & ;;
        widget) "$widget" --instance 4x2 --instance 4x4 > "$work/widget.log" 2>&1 & ;;
        xfce4-panel) xfce4-panel > "$work/xfce4-panel.log" 2>&1 & ;;
        gnome-weather) gnome-weather > "$work/gnome-weather.log" 2>&1 & ;;
    esac
    pid=$!
}

# The process's children and theirs, but not EFL's desktop-file cache
# daemon: like xfconfd, dconf and the accessibility bus it serves the whole
# session, so it is left running (and ended at the end) and counted for
# nobody.
descendants() {
    local child
    for child in $(ps -o pid= --ppid "$1"); do
        if [ "$(cat "/proc/$child/comm" 2> /dev/null)" = efreetd ]; then
            echo "$child" >> "$work/services"
            continue
        fi
        echo "$child"
        descendants "$child"
    done
}

stop_subject() {
    local all
    all="$pid $(descendants "$pid" | tr '\n' ' ')"
    # shellcheck disable=SC2086 # a list of pids
    kill $all 2> /dev/null || true
    for _ in $(seq 50); do
        kill -0 "$pid" 2> /dev/null || break
        sleep 0.1
    done
    # shellcheck disable=SC2086
    kill -KILL $all 2> /dev/null || true
    wait "$pid" 2> /dev/null || true
    pid=
}

# Milliseconds since the EPOCHREALTIME value $1.
elapsed_ms() {
    awk -v a="$1" -v b="$EPOCHREALTIME" 'BEGIN { printf "%.1f", (b - a) * 1000 }'
}

# Waits until a window of process $1 is mapped; prints the ms since $2.
wait_mapped() {
    local deadline=$((SECONDS + 30))
    until xdotool search --onlyvisible --pid "$1" > /dev/null 2>&1; do
        kill -0 "$1" 2> /dev/null || return 1
        [ $SECONDS -lt $deadline ] || return 1
        sleep 0.005
    done
    elapsed_ms "$2"
}

# Sums "<key> <n> kB" of /proc/<pid>/<file> over the pids given.
sum_kib() {
    local file=$1 key=$2
    shift 2
    local p
    for p in "$@"; do cat "/proc/$p/$file" 2> /dev/null || true; done |
        awk -v key="$key" '$1 == key { sum += $2 } END { print sum + 0 }'
}

declare -A samples
add_sample() { samples[$1|$2]="${samples[$1|$2]:-} $3"; }

measure() {
    local subject=$1 keep=$2 t0 ms tree wrapper plugin_ms
    t0=$EPOCHREALTIME
    start_subject "$subject"
    if ! ms=$(wait_mapped "$pid" "$t0"); then
        why_not[$subject]="no window was mapped within 30 s (log: $(tail -n 3 "$work/$subject.log" 2> /dev/null | tr '\n' ' '))"
        stop_subject
        return
    fi
    if [ "$subject" = xfce4-panel ]; then
        # The weather plugin runs in a wrapper process of the panel.
        for _ in $(seq 2000); do
            wrapper=$(pgrep -P "$pid" -f wrapper | head -n 1 || true)
            [ -n "$wrapper" ] && break
            sleep 0.005
        done
        if [ -n "$wrapper" ] && plugin_ms=$(wait_mapped "$wrapper" "$t0"); then
            [ "$keep" = 0 ] || add_sample "$subject" plugin_mapped_ms "$plugin_ms"
        fi
    fi
    if [ "$subject" = widget ]; then
        "$ctl" idle 10 > /dev/null || true
    fi
    sleep "$settle"
    mapfile -t tree < <(echo "$pid"; descendants "$pid")
    if [ "$keep" = 1 ]; then
        add_sample "$subject" mapped_ms "$ms"
        add_sample "$subject" rss_kib "$(sum_kib status VmRSS: "${tree[@]}")"
        add_sample "$subject" pss_kib "$(sum_kib smaps_rollup Pss: "${tree[@]}")"
        add_sample "$subject" processes "${#tree[@]}"
    fi
    stop_subject
}

for round in $(seq 0 "$runs"); do
    for subject in "${subjects[@]}"; do
        [ -z "${why_not[$subject]:-}" ] || continue
        echo "x11: round $round/$runs: $subject" >&2
        measure "$subject" $((round > 0 ? 1 : 0))
    done
done

median() { tr ' ' '\n' | grep . | sort -n | awk '{ v[NR] = $1 } END { print (NR % 2) ? v[(NR + 1) / 2] : (v[NR / 2] + v[NR / 2 + 1]) / 2 }'; }

for subject in "${subjects[@]}"; do
    if [ -n "${why_not[$subject]:-}" ]; then
        printf '# %s: could not be run: %s\n' "$subject" "${why_not[$subject]}" >> "$results"
        continue
    fi
    for metric in mapped_ms plugin_mapped_ms rss_kib pss_kib processes; do
        values=${samples[$subject|$metric]:-}
        [ -n "$values" ] || continue
        count=$(echo "$values" | wc -w)
        unit=${metric##*_}
        [ "$metric" != processes ] || unit=count
        printf 'x11\t%s\t%s\t%s\t%s\t%s\t%s\n' "$subject" "${metric%_*}" "$(echo "$values" | median)" \
            "$unit" "$count" "$(tr ' ' ',' <<< "${values# }")" >> "$results"
    done
done
