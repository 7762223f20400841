################################################################################
#
# libedid-composer
#
################################################################################

LIBEDID_COMPOSER_VERSION = 1.0.0
# The source tree that this file is in. Of a release, name its archive here.
LIBEDID_COMPOSER_SITE = $(BR2_EXTERNAL_EDID_COMPOSER_PATH)/../..
LIBEDID_COMPOSER_SITE_METHOD = local
LIBEDID_COMPOSER_LICENSE = MIT
LIBEDID_COMPOSER_LICENSE_FILES = LICENSE
LIBEDID_COMPOSER_INSTALL_STAGING = YES
# Hosts bring a configuration of their own, or ask for the store, which needs
# toml++. Hardening is Buildroot's choice (BR2_SSP_*, BR2_RELRO_*, BR2_FORTIFY_*).
LIBEDID_COMPOSER_CONF_OPTS = \
	-DBUILD_TESTING=OFF \
	-DEDID_COMPOSER_HOST=OFF \
	-DEDID_COMPOSER_HARDENING=OFF

$(eval $(cmake-package))
