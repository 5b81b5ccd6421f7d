#!/usr/bin/env -S sed -E -f
# Links to headings of the same page, which doxygen does not find by the names that they have elsewhere.
s/\]\(#[a-z0-9-]+\)/]/g
