# Stands in for the toolchain file of the NDK, which no Debian package has: the same compiler for the
# same targets, with the C headers of another system and a C library that holds names alone.
# OMACP_ANDROID_TARGET, OMACP_ANDROID_FLAGS and OMACP_ANDROID_LIBRARIES say the rest.
set(CMAKE_SYSTEM_NAME Linux)
set(ANDROID TRUE)
set(CMAKE_TRY_COMPILE_TARGET_TYPE STATIC_LIBRARY)
list(APPEND CMAKE_TRY_COMPILE_PLATFORM_VARIABLES OMACP_ANDROID_TARGET OMACP_ANDROID_FLAGS
     OMACP_ANDROID_LIBRARIES
)
foreach(language C CXX)
    set(CMAKE_${language}_COMPILER_TARGET ${OMACP_ANDROID_TARGET})
    set(CMAKE_${language}_FLAGS_INIT ${OMACP_ANDROID_FLAGS})
    set(CMAKE_${language}_STANDARD_LIBRARIES_INIT ${OMACP_ANDROID_LIBRARIES})
endforeach()
set(CMAKE_C_COMPILER clang-14)
set(CMAKE_CXX_COMPILER clang++-14)
set(CMAKE_SHARED_LINKER_FLAGS_INIT "-nostdlib --ld-path=/usr/bin/ld.lld-14")
