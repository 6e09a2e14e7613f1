hmi_add_test(flows arbitration)
hmi_add_test(flows backnavigation)
hmi_add_test(flows keyhandling)
hmi_add_test(flows viewrequest)
