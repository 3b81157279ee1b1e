# Colour, MIME and lifecycle tests.
