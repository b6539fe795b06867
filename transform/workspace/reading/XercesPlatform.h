// The XML library's own state: set up once, on first use, by whichever thread comes first; kept to the end of
// the process, because parsers may live as long as that.
#pragma once

void ensureXercesPlatform();
