#!/bin/sh
# Pictures of every sample page state at both sizes, taken through the
# widget host: snapshot-layouts.sh <build dir> <output dir>
set -eu
build=$(cd "$1" && pwd)
mkdir -p "$2"
out=$(cd "$2" && pwd)
sample=$build/widget/samples/weather-layout-sample
ctl=$build/platform/tools/widgetctl/widgetctl
id=com.quorvex.weather-m-widget.layout-sample

export ECORE_NO_SYSTEM_MODULES=1 EINA_LOG_BACKTRACE=0 EINA_LOG_LEVELS=ecore_con:0
PLATFORM_ROOT=$(mktemp -d)
export PLATFORM_ROOT
trap 'rm -rf "$PLATFORM_ROOT"' EXIT
unset DISPLAY WAYLAND_DISPLAY

for state in city current nonetwork pressed nocity loading; do
    WEATHER_SAMPLE_STATE=$state "$sample" --widget-id $id --instance 4x2 --instance 4x4 \
        > "$out/host-$state.log" 2>&1 &
    host=$!
    tries=0
    until "$ctl" --widget-id $id idle 10 > /dev/null 2>&1; do
        tries=$((tries + 1))
        if [ $tries -gt 50 ] || ! kill -0 $host 2> /dev/null; then
            echo "the sample host did not answer; see $out/host-$state.log" >&2
            kill $host 2> /dev/null || true
            exit 1
        fi
        sleep 0.2
    done
    "$ctl" --widget-id $id snapshot $id:1 "$out/4x2-$state.png"
    "$ctl" --widget-id $id snapshot $id:2 "$out/4x4-$state.png"
    "$ctl" --widget-id $id exit > /dev/null
    wait $host || true
done
