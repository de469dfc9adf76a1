# Our own code builds with strict warnings, all of them errors.
function(kruszarka_warnings target)
  target_compile_options(${target} PRIVATE
    -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wsign-conversion -Wold-style-cast
    -Wnull-dereference -Werror)
endfunction()
