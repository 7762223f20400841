#!/bin/sh
# Shows on a V4L2 capture device what the display at a connector can take.
#
#   v4l2_capture.sh EDID DEVICE [OPTION OF COMPOSE]...
#   v4l2_capture.sh /sys/class/drm/card0-HDMI-A-1/edid /dev/video0 --platform box.toml --port 1
#
# To be run whenever the display changes, for instance by udev. Where nothing is plugged in, the connector's EDID is
# empty, and the device shows what the platform offers by itself. Needs edid-composer and v4l2-ctl (Debian: v4l-utils) in
# PATH.
set -eu

if [ $# -lt 2 ]; then
  echo "usage: $0 EDID DEVICE [OPTION OF COMPOSE]..." >&2
  exit 2
fi
connector=$1
device=$2
shift 2

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
trap 'exit 1' HUP INT TERM

# The size of a file in sysfs means nothing: read it. Once, so that what is tested is what is composed from.
cat -- "$connector" >"$work/sink.bin"
if [ -s "$work/sink.bin" ]; then
  set -- --sink "$work/sink.bin" "$@"
fi
edid-composer compose "$@" -o "$work/new.bin"

# The driver lowers and raises the hot-plug line of its input by itself.
v4l2-ctl -d "$device" --set-edid=pad=0,file="$work/new.bin",format=raw
