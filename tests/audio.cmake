# Audio tests.

# Channel labels, layouts, layout analysis, conversion matrix.

# Formats, channel maps, buses, native rates, descriptions.
