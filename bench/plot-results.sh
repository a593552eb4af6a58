#!/usr/bin/env bash
# Draws start-up and memory side by side for the floor, the widget and the
# peers from a results file of scripts/bench-compare.
# usage: bench/plot-results.sh RESULTS.tsv OUT.png
set -euo pipefail
results=$1
out=$2
data=$(mktemp /tmp/weather-bench-plot.XXXXXX)
trap 'rm -f "$data"' EXIT

# One row per subject: label, start-up ms, RSS MiB, PSS MiB ("-" when missing).
awk -F'\t' '
    /^#/ { next }
    { sub(/\/0$/, "", $2); value[$1 "|" $2 "|" $3] = $4 }
    function get(key, scale) { return (key in value) ? sprintf("%.1f", value[key] / scale) : "-" }
    function row(label, start, rss, pss) {
        printf "\"%s\"\t%s\t%s\t%s\n", label, get(start, 1), get(rss, 1024), get(pss, 1024)
    }
    END {
        row("floor\\nbuffer", "headless|BM_StartToBareWindowDrawn|real_time",
            "headless|BM_MemoryTwoInstances|bare_rss_KiB", "headless|BM_MemoryTwoInstances|bare_pss_KiB")
        row("floor + text\\nbuffer", "headless|BM_StartToBareWindowDrawn/1|real_time", "-", "-")
        row("widget\\nbuffer", "headless|BM_StartToFirstInstance|real_time",
            "headless|BM_MemoryTwoInstances|widget_rss_KiB", "headless|BM_MemoryTwoInstances|widget_pss_KiB")
        row("floor\\nX11", "x11|floor|mapped", "x11|floor|rss", "x11|floor|pss")
        row("widget\\nX11", "x11|widget|mapped", "x11|widget|rss", "x11|widget|pss")
        row("Xfce panel\\n+ weather\\nX11", "x11|xfce4-panel|mapped", "x11|xfce4-panel|rss", "x11|xfce4-panel|pss")
        row("GNOME\\nWeather\\nX11", "x11|gnome-weather|mapped", "x11|gnome-weather|rss", "x11|gnome-weather|pss")
    }' "$results" > "$data"

title=$(sed -n '1s/^# //p' "$results" | cut -d, -f1-2)
gnuplot << PLOT
set terminal pngcairo size 1400,640 font "sans,10"
set output "$out"
set datafile separator "\t"
set datafile missing "-"
set style data histograms
set style fill solid 0.85 border -1
set boxwidth 0.8
set grid ytics
set yrange [0:*]
set key top left
set bmargin 5
set multiplot layout 1,2 title "Weather widget beside a bare Elementary window and two peers ($title)"
set title "Start-up: process start to first instance drawn (buffer) / first window mapped (X11)"
set ylabel "ms (median, log scale)"
set logscale y
set yrange [10:*]
set style histogram clustered gap 1
plot "$data" using 2:xtic(1) title "start-up" linecolor rgb "#3b7dd8", \
     '' using 0:2:2 with labels offset 0,0.7 notitle
set title "Memory once settled (widget: 4x2 + 4x4, ten cities)"
set ylabel "MiB (median)"
unset logscale y
set yrange [0:*]
plot "$data" using 3:xtic(1) title "RSS" linecolor rgb "#d8783b", \
     '' using 4 title "PSS" linecolor rgb "#5aa55a", \
     '' using (\$0 - 0.2):3:3 with labels offset 0,0.7 notitle, \
     '' using (\$0 + 0.2):4:4 with labels offset 0,0.7 notitle
unset multiplot
PLOT
echo "$out"
