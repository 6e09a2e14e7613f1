hmi_add_test(named namedstate)
