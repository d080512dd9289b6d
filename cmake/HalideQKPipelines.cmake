# Ahead-of-time pipelines.
#
# Each kernel family declares its generators and pipelines in one call:
#
#   halideqk_family(fill
#     SOURCES   set_rect.cpp move_rect.cpp ...
#     PIPELINES SetRect SetRectDeep MoveRect ...)
#
# Every pipeline is compiled twice, as HalideGenQK<Name>_sse41 and
# HalideGenQK<Name>_avx2, and all of them share one Halide runtime.  The
# generator registered under <Name> builds pipeline <Name>.

set(HALIDEQK_TARGET_sse41 x86-64-linux-sse41)
set(HALIDEQK_TARGET_avx2 x86-64-linux-avx-avx2-fma-f16c-sse41)
set(HALIDEQK_SETS sse41 avx2)

function(halideqk_family FAMILY)
    cmake_parse_arguments(ARG "" "" "SOURCES;PIPELINES" ${ARGN})
    set(gen halideqk_gen_${FAMILY})
    add_halide_generator(${gen} SOURCES ${ARG_SOURCES})
    target_include_directories(${gen} PRIVATE ${PROJECT_SOURCE_DIR})

    foreach (pipeline IN LISTS ARG_PIPELINES)
        foreach (set IN LISTS HALIDEQK_SETS)
            set(lib HalideGenQK${pipeline}_${set})
            get_property(runtime GLOBAL PROPERTY HALIDEQK_RUNTIME)
            if (runtime)
                set(use_runtime USE_RUNTIME ${runtime})
            else ()
                set(use_runtime)
            endif ()
            add_halide_library(${lib} FROM ${gen}
                               GENERATOR ${pipeline}
                               FUNCTION_NAME ${lib}
                               TARGETS ${HALIDEQK_TARGET_${set}}
                               ${use_runtime})
            if (NOT runtime)
                set_property(GLOBAL PROPERTY HALIDEQK_RUNTIME ${lib}.runtime)
            endif ()
            set_property(GLOBAL APPEND PROPERTY HALIDEQK_PIPELINE_LIBS ${lib})
            set_property(GLOBAL APPEND PROPERTY HALIDEQK_PIPELINE_HEADERS ${lib}.h)
        endforeach ()
    endforeach ()
endfunction()

# One header that declares every pipeline, for the adapters.
function(halideqk_write_pipeline_header OUT)
    get_property(headers GLOBAL PROPERTY HALIDEQK_PIPELINE_HEADERS)
    set(text "// Generated: declares every ahead-of-time pipeline.\n#pragma once\n")
    foreach (h IN LISTS headers)
        string(APPEND text "#include \"${h}\"\n")
    endforeach ()
    file(GENERATE OUTPUT ${OUT} CONTENT "${text}")
endfunction()
