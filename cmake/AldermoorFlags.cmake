# One INTERFACE target with the language level, the warnings and the floating-point rules of the
# project. It is linked privately, so that none of it reaches the targets of a user.

add_library(aldermoor_flags INTERFACE)
target_compile_features(aldermoor_flags INTERFACE cxx_std_20)

target_compile_options(aldermoor_flags INTERFACE
  # Results are part of the interface: every product and sum is rounded where it stands.
  -ffp-contract=off
  # A source location reads "/src/aldermoor/..." on every machine.
  "-fdebug-prefix-map=${PROJECT_SOURCE_DIR}=."
  "-fmacro-prefix-map=${PROJECT_SOURCE_DIR}="
  -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Wold-style-cast -Wcast-align
  -Woverloaded-virtual -Wconversion -Wsign-conversion -Wdouble-promotion -Wfloat-conversion
  -Wformat=2 -Wimplicit-fallthrough -Wextra-semi
  # GCC 12 takes "text" + std::to_string(n) for an overlapping copy at -O3.
  $<$<CXX_COMPILER_ID:GNU>:-Wno-restrict>
  $<$<BOOL:${ALDERMOOR_WERROR}>:-Werror>)

set(ALDERMOOR_SANITIZE "" CACHE STRING "Sanitizers to build with, for instance address,undefined")
if(ALDERMOOR_SANITIZE)
  target_compile_options(aldermoor_flags INTERFACE
    -fsanitize=${ALDERMOOR_SANITIZE} -fno-sanitize-recover=all -fno-omit-frame-pointer)
  target_link_options(aldermoor_flags INTERFACE -fsanitize=${ALDERMOOR_SANITIZE})
endif()

option(ALDERMOOR_COVERAGE "Instrument for coverage" OFF)
if(ALDERMOOR_COVERAGE)
  target_compile_options(aldermoor_flags INTERFACE --coverage)
  target_link_options(aldermoor_flags INTERFACE --coverage)
endif()
