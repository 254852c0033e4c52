# Warnings and sanitizers shared by every target of the project.
# penmoor_target_defaults(<target>) applies them to one target.

function(penmoor_target_defaults target)
    if(MSVC)
        target_compile_options(${target} PRIVATE /W4 /permissive- /utf-8)
        if(PENMOOR_WERROR)
            target_compile_options(${target} PRIVATE /WX)
        endif()
    else()
        target_compile_options(${target} PRIVATE -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor
                                                 -Wold-style-cast -Woverloaded-virtual)
        if(PENMOOR_WERROR)
            target_compile_options(${target} PRIVATE -Werror)
        endif()
    endif()
endfunction()

if(PENMOOR_SANITIZE)
    add_compile_options(-fsanitize=${PENMOOR_SANITIZE} -fno-omit-frame-pointer -fno-sanitize-recover=undefined)
    add_link_options(-fsanitize=${PENMOOR_SANITIZE})
endif()

# Fuzz builds instrument every library for coverage; only the fuzz targets link the fuzzer.
if(PENMOOR_BUILD_FUZZ)
    add_compile_options(-fsanitize=fuzzer-no-link)
endif()
