# What happens when the library is used as it is not meant to be: docs/misuse.md.
foreach(name IN ITEMS gonewhilerunning nullarguments)
    hmi_add_test(misuse ${name})
endforeach()
