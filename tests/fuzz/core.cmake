# zebcore fuzz targets.
