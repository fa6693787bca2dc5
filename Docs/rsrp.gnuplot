# SPDX-License-Identifier: Apache-2.0
# RSRP over time, one colour a cell: the cells that most of the lines are about.
#
#     kelvasictl readings --select rsrp --format csv drive.pcap >rsrp.csv
#     gnuplot rsrp.gnuplot
#
# For another input or output: gnuplot -e 'csv = "a.csv"; picture = "a.png"; cells = 4' rsrp.gnuplot
if (!exists("csv")) csv = "rsrp.csv"
if (!exists("picture")) picture = "rsrp.png"
if (!exists("cells")) cells = 8

set datafile separator ","
names = system(sprintf("tail -n +2 '%s' | cut -d, -f7 | grep . | sort | uniq -c | sort -k1,1nr -k2 | head -n %d | awk '{print $2}'", csv, cells))

set terminal pngcairo size 860,360 font "sans,10" background "white"
set output picture
set xdata time
set timefmt "%Y-%m-%dT%H:%M:%SZ"
set format x "%H:%M"
set ylabel "RSRP (dBm)"
set grid linetype 1 linecolor "#dddddd"
set border 3 linecolor "#888888"
set tics nomirror
set linetype 5 linecolor "#8c564b"  # its yellow is too light for white
set key outside right top
plot for [name in names] csv using 1:(strcol(7) eq name ? $9 : NaN) with points pointtype 7 pointsize 0.35 title name
