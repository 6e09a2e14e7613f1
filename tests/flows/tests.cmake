hmi_add_test(flows keyhandling)
