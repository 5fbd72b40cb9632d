# Checks the export or import table of a Windows DLL or program, as printed by
# `objdump -p`. Run with cmake -P and these variables:
#   OBJDUMP  the objdump of the MinGW-w64 binutils
#   FILES    the DLLs or programs to check (a ;-list); for MODE runtime also
#   DIRECTORY, whose .dll and .exe files are all checked
#   MODE     library: every exported name is a member of CSwatchlogFactory or
#                     CColorPatch (or their vtable or type information), and
#                     GetReaderWriter and CColorPatch::GetCMYK are among them;
#            engine:  the exports are exactly the engine's four functions;
#            runtime: no MinGW runtime DLL (libstdc++, libgcc, winpthread) is
#                     imported, so nothing but system DLLs and our own two
#                     DLLs must stand beside the file.

function(objdump_private_headers file out_var)
    execute_process(COMMAND ${OBJDUMP} -p ${file} OUTPUT_VARIABLE text ERROR_VARIABLE err
                    RESULT_VARIABLE rc)
    if(NOT rc EQUAL 0)
        message(FATAL_ERROR "${OBJDUMP} -p ${file} failed (${rc}): ${err}")
    endif()
    set(${out_var} "${text}" PARENT_SCOPE)
endfunction()

# Names of the "[Ordinal/Name Pointer] Table": lines "\t[   n] name" up to the
# first blank line.
function(exported_names text out_var)
    set(names)
    string(FIND "${text}" "[Ordinal/Name Pointer] Table" start)
    if(start GREATER_EQUAL 0)
        string(SUBSTRING "${text}" ${start} -1 table)
        string(REPLACE "\n" ";" lines "${table}")
        list(REMOVE_AT lines 0)
        foreach(line IN LISTS lines)
            if(line MATCHES "^[ \t]*\\[ *[0-9]+\\] (.+)$")
                list(APPEND names "${CMAKE_MATCH_1}")
            else()
                break()
            endif()
        endforeach()
    endif()
    set(${out_var} "${names}" PARENT_SCOPE)
endfunction()

if(DIRECTORY)
    file(GLOB built_files ${DIRECTORY}/*.dll ${DIRECTORY}/*.exe)
    list(APPEND FILES ${built_files})
endif()
if(NOT FILES)
    message(FATAL_ERROR "nothing to check")
endif()

set(failures)
foreach(file IN LISTS FILES)
    objdump_private_headers(${file} text)
    get_filename_component(file_name ${file} NAME)

    if(MODE STREQUAL "library")
        exported_names("${text}" names)
        # Itanium C++ names: _ZN, optional cv/ref qualifiers of a member
        # function, then the length-prefixed class name; _ZTV, _ZTI and _ZTS
        # are the vtable, type information and type name of a class.
        set(class_names "(11CColorPatch|17CSwatchlogFactory)")
        foreach(name IN LISTS names)
            if(NOT name MATCHES "^_ZN[rVKRO]*${class_names}[0-9A-Za-z_]"
               AND NOT name MATCHES "^_ZT[VIS]${class_names}$")
                list(APPEND failures "${file_name} exports ${name}")
            endif()
        endforeach()
        # GetReaderWriter(enumReaderwriterType) and CColorPatch::GetCMYK() const.
        foreach(required "^_ZN17CSwatchlogFactory15GetReaderWriterE" "^_ZNK11CColorPatch7GetCMYKEv$")
            set(found FALSE)
            foreach(name IN LISTS names)
                if(name MATCHES "${required}")
                    set(found TRUE)
                endif()
            endforeach()
            if(NOT found)
                list(APPEND failures "${file_name} exports no name matching ${required}")
            endif()
        endforeach()
    elseif(MODE STREQUAL "engine")
        exported_names("${text}" names)
        list(SORT names)
        set(expected HUEKIT_fromCIELABToCIEXYZ HUEKIT_fromCIEXYZToCIELAB HUEKIT_fromSpectralToCIEXYZ
                     HUEKIT_fromSpectralToDensity)
        if(NOT names STREQUAL expected)
            list(APPEND failures "${file_name} exports [${names}] instead of [${expected}]")
        endif()
    elseif(MODE STREQUAL "runtime")
        string(REGEX MATCHALL "DLL Name: [^\n]+" imports "${text}")
        if(NOT imports)
            list(APPEND failures "${file_name} shows no import table")
        endif()
        foreach(entry IN LISTS imports)
            string(REPLACE "DLL Name: " "" dll "${entry}")
            string(TOLOWER "${dll}" dll_lower)
            if(dll_lower MATCHES "^lib(stdc\\+\\+|gcc|winpthread)")
                list(APPEND failures "${file_name} imports the runtime DLL ${dll}")
            endif()
        endforeach()
    else()
        message(FATAL_ERROR "unknown MODE '${MODE}'")
    endif()
endforeach()

if(failures)
    string(REPLACE ";" "\n  " report "${failures}")
    message(FATAL_ERROR "DLL table check failed:\n  ${report}")
endif()
list(LENGTH FILES count)
message(STATUS "checked ${MODE} of ${count} files")
