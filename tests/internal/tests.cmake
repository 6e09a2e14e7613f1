hmi_add_test(internal helpers)
hmi_add_test(internal logging)
hmi_add_test(internal loggingfunctor)
