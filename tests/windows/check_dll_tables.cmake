# Checks the export or import tables of Windows DLLs and programs, as printed by
# `objdump -p`. Run with cmake -P and OBJDUMP (the MinGW-w64 objdump), FILES (a
# ;-list) or DIRECTORY (every .dll and .exe in it), and MODE:
#   library  every export is a member, vtable or type information of
#            CSwatchlogFactory or CColorPatch, and GetReaderWriter and
#            CColorPatch::GetCMYK are among them (an empty table fails);
#   engine   the exports are exactly the engine's four functions;
#   runtime  no MinGW runtime DLL (libstdc++, libgcc, winpthread) is imported.
if(DIRECTORY)
    file(GLOB FILES ${DIRECTORY}/*.dll ${DIRECTORY}/*.exe)
endif()
if(NOT FILES OR NOT MODE MATCHES "^(library|engine|runtime)$")
    message(FATAL_ERROR "usage: MODE library|engine|runtime with FILES or DIRECTORY")
endif()
# Itanium names: _ZN, a member function's cv/ref qualifiers, the length-prefixed
# class name; _ZTV, _ZTI, _ZTS are a class's vtable, type information, type name.
set(classes "(11CColorPatch|17CSwatchlogFactory)")
set(failures)
foreach(file IN LISTS FILES)
    execute_process(COMMAND ${OBJDUMP} -p ${file} OUTPUT_VARIABLE text RESULT_VARIABLE rc)
    get_filename_component(name ${file} NAME)
    if(NOT rc EQUAL 0)
        list(APPEND failures "${OBJDUMP} -p ${name} failed (${rc})")
        continue()
    endif()
    # The names of the "[Ordinal/Name Pointer] Table": the lines "\t[   n] name"
    # right below its title.
    set(exports)
    if(text MATCHES "\n\\[Ordinal/Name Pointer\\] Table\n(([ \t]*\\[ *[0-9]+\\] [^\n]+\n)+)")
        string(REGEX MATCHALL "\\] [^\n]+" exports "${CMAKE_MATCH_1}")
        string(REPLACE "] " "" exports "${exports}")
    endif()
    if(MODE STREQUAL "library")
        foreach(export IN LISTS exports)
            if(NOT export MATCHES "^(_ZN[rVKRO]*${classes}[0-9A-Za-z_]|_ZT[VIS]${classes}$)")
                list(APPEND failures "${name} exports ${export}")
            endif()
        endforeach()
        foreach(required "_ZN17CSwatchlogFactory15GetReaderWriterE" "_ZNK11CColorPatch7GetCMYKEv")
            if(NOT "${exports}" MATCHES "(^|;)${required}")
                list(APPEND failures "${name} does not export ${required}")
            endif()
        endforeach()
    elseif(MODE STREQUAL "engine")
        list(SORT exports)
        set(expected HUEKIT_fromCIELABToCIEXYZ HUEKIT_fromCIEXYZToCIELAB
                     HUEKIT_fromSpectralToCIEXYZ HUEKIT_fromSpectralToDensity)
        if(NOT exports STREQUAL expected)
            list(APPEND failures "${name} exports [${exports}] instead of [${expected}]")
        endif()
    else()
        string(REGEX MATCHALL "DLL Name: [^\n]+" imports "${text}")
        if(NOT imports)
            list(APPEND failures "${name} shows no import table")
        endif()
        string(TOLOWER "${imports}" imports)
        if(imports MATCHES "dll name: (lib(stdc\\+\\+|gcc|winpthread)[^;]*)")
            list(APPEND failures "${name} imports the runtime DLL ${CMAKE_MATCH_1}")
        endif()
    endif()
endforeach()
if(failures)
    list(JOIN failures "\n  " report)
    message(FATAL_ERROR "DLL table check failed:\n  ${report}")
endif()
