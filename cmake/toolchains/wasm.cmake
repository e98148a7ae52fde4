# WebAssembly by Debian's emscripten, run by Node. Its optimiser, and so each link, needs NODE_PATH=/usr/share/nodejs in
# the environment.
#
# One file holds the program, since the loader would fetch a second one by a URL, which newer versions of Node refuse to
# take a plain path for.
set(EMSCRIPTEN_SYSTEM_PROCESSOR wasm32)
include(/usr/share/emscripten/cmake/Modules/Platform/Emscripten.cmake)
set(CMAKE_CXX_FLAGS_INIT -fexceptions)
set(CMAKE_EXE_LINKER_FLAGS_INIT
    "-fexceptions -sSINGLE_FILE=1 -sNODERAWFS=1 -sALLOW_MEMORY_GROWTH=1 -sEXIT_RUNTIME=1")
