# Video format tests.
