# Colour fuzz targets.
