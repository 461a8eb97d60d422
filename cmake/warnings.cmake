# Warnings, hardening and sanitizers that every target of ours is built with.
add_library(zel-compile-options INTERFACE)
target_compile_options(zel-compile-options INTERFACE
  -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wsign-conversion -Wformat=2 -Wundef -Werror
  $<$<COMPILE_LANGUAGE:CXX>:-Wnon-virtual-dtor -Woverloaded-virtual -Wold-style-cast -Wextra-semi>
  # Designated initialisers leave the rest of a table row at its default: that is their use here.
  -Wno-missing-field-initializers)
if(ZEL_SANITIZE)
  target_compile_options(zel-compile-options INTERFACE
    -fsanitize=${ZEL_SANITIZE} -fno-omit-frame-pointer -fno-sanitize-recover=all)
  target_link_options(zel-compile-options INTERFACE -fsanitize=${ZEL_SANITIZE})
else()
  # The library's callers may have small stacks; a sanitizer's red zones do not count.
  target_compile_options(zel-compile-options INTERFACE -Wframe-larger-than=16384)
  target_compile_options(zel-compile-options INTERFACE
    $<$<NOT:$<CONFIG:Debug>>:-fstack-protector-strong -fstack-clash-protection -fcf-protection
    -U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=2>)
  target_link_options(zel-compile-options INTERFACE
    $<$<NOT:$<CONFIG:Debug>>:-Wl,-z,relro -Wl,-z,now -Wl,-z,noexecstack>)
endif()
target_link_options(zel-compile-options INTERFACE -Wl,--as-needed)
