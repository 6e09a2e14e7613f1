hmi_add_test(flows arbitration)
hmi_add_test(flows keyhandling)
