SUMMARY = "Composes the EDID that a box shows on its HDMI input"
DESCRIPTION = "For repeaters, set-top boxes, soundbars and capture boxes: composes the EDID of their HDMI input from the \
EDID of the display behind them and their own configuration."
LICENSE = "MIT"
LIC_FILES_CHKSUM = "file://LICENSE;md5=2c525bc6a96c5ab2f68b3494b533c7e1"

# The source tree that this layer is in. Of a release, name its archive in SRC_URI, and leave this out.
inherit cmake externalsrc
EXTERNALSRC = "${@os.path.abspath(os.path.join(d.getVar('THISDIR'), '../../../..'))}"

# Hosts bring a configuration of their own, or ask for the store, which needs toml++. Hardening is the distribution's
# choice (security_flags.inc).
EXTRA_OECMAKE = "-DBUILD_TESTING=OFF -DEDID_COMPOSER_HOST=OFF -DEDID_COMPOSER_HARDENING=OFF"
