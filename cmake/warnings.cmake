# Warnings, hardening and sanitizers that every target of ours is built with.
include(CheckCXXCompilerFlag)
add_library(zel-compile-options INTERFACE)
target_compile_options(zel-compile-options INTERFACE
  -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wsign-conversion -Wformat=2 -Wundef -Werror
  $<$<COMPILE_LANGUAGE:CXX>:-Wnon-virtual-dtor -Woverloaded-virtual -Wold-style-cast -Wextra-semi>
  # Designated initialisers leave the rest of a table row at its default: that is their use here.
  -Wno-missing-field-initializers
  # GCC 12 sees overlapping copies in "text" + std::string that are none (mended in GCC 13).
  $<$<AND:$<COMPILE_LANG_AND_ID:CXX,GNU>,$<CONFIG:Release>>:-Wno-restrict>)
# -Wreserved-identifier stays off, as in .clang-tidy: names with leading double underscores are this
# system's published names.

add_library(zel-hardening INTERFACE)
# Not every processor's compiler has these: the library is built for the phone's as well.
foreach(flag IN ITEMS -fstack-protector-strong -fstack-clash-protection -fcf-protection)
  string(MAKE_C_IDENTIFIER "ZEL_HAS${flag}" has_flag)
  check_cxx_compiler_flag(${flag} ${has_flag})
  if(${has_flag})
    target_compile_options(zel-hardening INTERFACE ${flag})
  endif()
endforeach()
target_compile_options(zel-hardening INTERFACE -U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=2)
target_link_options(zel-hardening INTERFACE -Wl,-z,relro -Wl,-z,now -Wl,-z,noexecstack)

if(ZEL_SANITIZE)
  target_compile_options(zel-compile-options INTERFACE
    -fsanitize=${ZEL_SANITIZE} -fno-omit-frame-pointer -fno-sanitize-recover=all
    # GCC 12 follows the instrumentation into the standard library and warns of it; the plain builds keep these.
    $<$<CXX_COMPILER_ID:GNU>:-Wno-maybe-uninitialized -Wno-restrict -Wno-array-bounds -Wno-stringop-overflow
    -Wno-stringop-overread -Wno-dangling-pointer>)
  target_link_options(zel-compile-options INTERFACE -fsanitize=${ZEL_SANITIZE})
else()
  # The library's callers may have small stacks; a sanitizer's red zones do not count.
  target_compile_options(zel-compile-options INTERFACE -Wframe-larger-than=16384)
  if(NOT CMAKE_BUILD_TYPE STREQUAL Debug)
    target_link_libraries(zel-compile-options INTERFACE zel-hardening)
  endif()
endif()
target_link_options(zel-compile-options INTERFACE -Wl,--as-needed)
