# Stands in for ndk-build, which no Debian package has: reads the two makefiles as it does and builds
# what they ask for into OUT, for ABI.
#
#   make -f tests/android/ndk-build.mk ABI=... TARGET=... OUT=... CXX=... FLAGS=... LIBRARIES=...
my-dir = jni
CLEAR_VARS = /dev/null
BUILD_SHARED_LIBRARY = /dev/null
TARGET_ARCH_ABI := $(ABI)

all:
include jni/Application.mk
include jni/Android.mk

ifeq (,$(filter $(ABI),$(APP_ABI)))
$(error jni/Application.mk does not build for $(ABI))
endif
platform := $(patsubst android-%,%,$(APP_PLATFORM))
objects := $(patsubst %.cpp,$(OUT)/%.o,$(notdir $(LOCAL_SRC_FILES)))
library := $(OUT)/lib$(LOCAL_MODULE).so

# In front of those of the makefile, what ndk-build gives by itself.
$(OUT)/%.o: jni/src/ClientProv/%.cpp
	@$(CXX) --target=$(TARGET)$(platform) -ffunction-sections -fdata-sections -funwind-tables \
	    -fstack-protector-strong -g -O2 -DNDEBUG -fPIC -Wformat -Werror=format-security -Werror \
	    $(FLAGS) $(LOCAL_CPPFLAGS) -c $< -o $@

$(library): $(objects)
	@$(CXX) --target=$(TARGET)$(platform) -shared -nostdlib -Wl,-soname,$(notdir $@) -Wl,--build-id \
	    -Wl,--no-undefined -Wl,--fatal-warnings -Wl,--gc-sections $(objects) $(LOCAL_LDFLAGS) \
	    $(LIBRARIES) -o $@

all: $(library)
.PHONY: all
