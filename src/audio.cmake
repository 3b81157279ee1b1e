# Audio: channel labels and layouts, analysis, matrices, formats, maps, buses, rates, descriptions.
