"""What the scripts share: the element table, the providers' data, spec files, media, the guide's tables."""
