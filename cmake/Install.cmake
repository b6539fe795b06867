# Filled in below the targets: what is installed and under which names.
