# 32-bit x86 is what the handsets have; the others are built along.
APP_ABI      := x86 x86_64 armeabi-v7a arm64-v8a
APP_PLATFORM := android-21
APP_OPTIM    := release
# The library uses no C++ runtime.
APP_STL      := none
