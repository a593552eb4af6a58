# shellcheck shell=sh
# Shell helpers shared by scripts/snapshots and scripts/demo: the build's
# programs, a fresh platform root, and the widget host driven through
# widgetctl. Source it, then call host_use_build with a built tree or
# host_use_installed with the folder of the installed programs.

widget_id=com.quorvex.weather-m-widget

# host_use_build BUILD_DIR: absolute paths of the programs the scripts run.
host_use_build() {
    build=$(cd "$1" && pwd)
    widget=$build/widget/weather-widget
    agent=$build/siblings/agent/weather-agent
    app=$build/siblings/app/weather-app
    ctl=$build/platform/tools/widgetctl/widgetctl
    vconftool=$build/platform/tools/vconftool/vconftool
    setup=$build/platform/tools/platform-setup/platform-setup
    res=$build/res
    host_environment
}

# host_use_installed BIN_DIR: the same for the programs installed in
# BIN_DIR; their platform-setup registers the resources installed with it.
host_use_installed() {
    bin=$(cd "$1" && pwd)
    widget=$bin/weather-widget
    agent=$bin/weather-agent
    app=$bin/weather-app
    ctl=$bin/widgetctl
    vconftool=$bin/vconftool
    setup=$bin/platform-setup
    res=
    host_environment
}

host_environment() {
    export ECORE_NO_SYSTEM_MODULES=1 EINA_LOG_BACKTRACE=0 EINA_LOG_LEVELS=ecore_con:0
    export PLATFORM_APP_ID=$widget_id
}

# host_missing_programs: names the programs host_use_build found missing.
host_missing_programs() {
    for program in "$widget" "$agent" "$app" "$ctl" "$vconftool" "$setup"; do
        [ -x "$program" ] || echo "$program"
    done
}

# host_new_root DIR [platform-setup options]: DIR becomes PLATFORM_ROOT,
# with a fresh phone's keys and the resources of the programs in use.
host_new_root() {
    PLATFORM_ROOT=$1
    export PLATFORM_ROOT
    shift
    if [ -n "$res" ]; then
        set -- --res "$res" "$@"
    fi
    "$setup" --root "$PLATFORM_ROOT" "$@" > /dev/null
}

# host_start LOG SIZE...: starts the widget with one instance per size,
# output to LOG, and waits until it has drawn its pages (host_pid is set).
# Fails when the host ends or never settles.
host_start() {
    log=$1
    shift
    instances=
    for size in "$@"; do instances="$instances --instance $size"; done
    # shellcheck disable=SC2086 # sizes are single words
    "$widget" $instances > "$log" 2>&1 &
    host_pid=$!
    tries=0
    until "$ctl" idle 2 > /dev/null 2>&1; do
        tries=$((tries + 1))
        if [ $tries -gt 50 ] || ! kill -0 "$host_pid" 2> /dev/null; then
            return 1
        fi
        sleep 0.2
    done
}

# host_stop: ends the host as the home screen would, or kills it.
host_stop() {
    [ -n "${host_pid:-}" ] || return 0
    "$ctl" exit > /dev/null 2>&1 || kill "$host_pid" 2> /dev/null || true
    wait "$host_pid" 2> /dev/null || true
    host_pid=
}

# host_ctl COMMAND [ARGS]: one widgetctl command; its reply goes to
# stderr only when it fails.
host_ctl() {
    if ! reply=$("$ctl" "$@" 2>&1); then
        echo "widgetctl $*: $reply" >&2
        return 1
    fi
}

# host_shoot N FILE: a PNG of instance N (1 is the first instance).
host_shoot() {
    host_ctl snapshot "$widget_id:$1" "$2"
}

# host_idle SECONDS: waits until no animation, job or short timer is left.
host_idle() {
    host_ctl idle "$1"
}

# host_swipe N X1 Y1 X2 Y2: a 200 ms swipe on instance N, a flick when
# it runs up or down over a page.
host_swipe() {
    host_ctl swipe "$widget_id:$1" "$2" "$3" "$4" "$5" 200
}

# host_tap N X Y
host_tap() {
    host_ctl tap "$widget_id:$1" "$2" "$3"
}
