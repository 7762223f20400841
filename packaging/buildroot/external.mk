include $(sort $(wildcard $(BR2_EXTERNAL_EDID_COMPOSER_PATH)/package/*/*.mk))
