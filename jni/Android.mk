LOCAL_PATH := $(call my-dir)

include $(CLEAR_VARS)
LOCAL_MODULE    := omacp
LOCAL_SRC_FILES := $(patsubst $(LOCAL_PATH)/%,%,$(sort $(wildcard $(LOCAL_PATH)/src/ClientProv/*.cpp)))
LOCAL_CPPFLAGS  := -std=c++20 -fno-exceptions -fno-rtti -fno-threadsafe-statics -nostdinc++ \
                   -fvisibility=hidden -fno-semantic-interposition -fstack-protector-strong \
                   -U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=3 \
                   -ffile-prefix-map=$(abspath $(LOCAL_PATH)/..)=. \
                   -Wall -Wextra -Wconversion -Wshadow
# What compilers have for these alone.
ifneq (,$(filter x86 x86_64,$(TARGET_ARCH_ABI)))
LOCAL_CPPFLAGS  += -fstack-clash-protection
endif
ifeq (x86_64,$(TARGET_ARCH_ABI))
LOCAL_CPPFLAGS  += -fcf-protection
endif
LOCAL_LDFLAGS   := -Wl,-Bsymbolic-functions -Wl,-z,nodelete
# Devices with 64 bits may have pages of 16 KiB.
ifneq (,$(filter arm64-v8a x86_64,$(TARGET_ARCH_ABI)))
LOCAL_LDFLAGS   += -Wl,-z,max-page-size=16384
endif
include $(BUILD_SHARED_LIBRARY)
