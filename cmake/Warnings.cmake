# raid::warnings: every target of this project links it; a warning is an error.
add_library(raid_warnings INTERFACE)
add_library(raid::warnings ALIAS raid_warnings)

set(both
    -Wall -Wextra -Wpedantic -Werror
    -Wshadow -Wconversion -Wsign-conversion -Wdouble-promotion
    -Wcast-align -Wcast-qual -Wformat=2 -Wundef -Wvla -Wswitch-enum -Wimplicit-fallthrough)
set(cxx -Wold-style-cast -Wnon-virtual-dtor -Woverloaded-virtual -Wextra-semi)
set(gnu -Wlogical-op -Wduplicated-cond -Wduplicated-branches)
# g++ 12 sees an overlap in every "literal" + std::string that it inlines; that is its mistake.
set(gnu_cxx -Wsuggest-override -Wno-restrict)

target_compile_options(raid_warnings INTERFACE
    ${both}
    "$<$<COMPILE_LANGUAGE:CXX>:${cxx}>"
    "$<$<C_COMPILER_ID:GNU>:${gnu}>"
    "$<$<AND:$<COMPILE_LANGUAGE:CXX>,$<CXX_COMPILER_ID:GNU>>:${gnu_cxx}>")
