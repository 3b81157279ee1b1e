# Time fuzz targets.
