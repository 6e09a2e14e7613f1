# Writes OUTPUT, a source with publicMetaObjects(): those of the classes in HEADERS, which lie in
# FOLDER and are included from its parent. A class that it cannot name ends it.

set(includes "")
set(classes "")
foreach(header IN LISTS HEADERS)
    file(READ ${FOLDER}/${header} text)
    string(REGEX MATCHALL "\n +Q_(OBJECT|GADGET)\n" macros "${text}")
    string(REGEX MATCHALL "\nclass [A-Z_]+_EXPORT [A-Za-z]+[^;{]*{ *\n +Q_(OBJECT|GADGET)\n" found "${text}")
    list(LENGTH macros macro_count)
    list(LENGTH found found_count)
    if(NOT macro_count EQUAL found_count OR text MATCHES "Q_NAMESPACE")
        message(FATAL_ERROR "${header}: a class with a meta-object whose name is not found")
    endif()
    get_filename_component(folder_name ${FOLDER} NAME)
    foreach(class IN LISTS found)
        string(REGEX REPLACE "^\nclass [A-Z_]+_EXPORT ([A-Za-z]+).*" "\\1" class "${class}")
        string(APPEND includes "#include <${folder_name}/${header}>\n")
        string(APPEND classes "        &HmiStateMachine::${class}::staticMetaObject,\n")
    endforeach()
endforeach()
if(classes STREQUAL "")
    message(FATAL_ERROR "No class with a meta-object in ${FOLDER}")
endif()
file(WRITE ${OUTPUT} "#include \"publicmetaobjects.h\"\n\n${includes}
QList<const QMetaObject *> publicMetaObjects()
{
    return {
${classes}    };
}
")
