# The warnings that all of this project's own code is free of. Whether they are errors is the preset's choice.
function(zarnmath_enable_warnings target)
    target_compile_options(${target} PRIVATE -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Wold-style-cast)
endfunction()
