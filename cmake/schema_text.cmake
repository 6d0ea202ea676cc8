# cmake -DOUT=file -DSCRIPTS=file;… -DUPGRADES=file;… -P schema_text.cmake
# Writes the source that holds the schema's texts. An upgrade's file is named after the version it leads to: 002.sql.
set(scripts "")
foreach(file IN LISTS SCRIPTS)
    file(READ ${file} text)
    string(APPEND scripts "    R\"sql(${text})sql\",\n")
endforeach()

set(steps "")
foreach(file IN LISTS UPGRADES)
    get_filename_component(number ${file} NAME_WE)
    math(EXPR version "1${number} - 1000")
    file(READ ${file} text)
    string(APPEND steps "    Upgrade{${version}, R\"sql(${text})sql\"},\n")
endforeach()

set(upgrades "return {};")
if(steps)
    set(upgrades "static constexpr Upgrade steps[]{\n${steps}    };\n    return steps;")
endif()

file(WRITE ${OUT} "#include \"core/schema_text.h\"

namespace kindrel::core {

std::span<const char* const> schema_scripts()
{
    static constexpr const char* scripts[]{
${scripts}    };
    return scripts;
}

std::span<const Upgrade> upgrade_scripts()
{
    ${upgrades}
}

}
")
