#pragma once

#include <vector>

#include "bench/Report.h"

// The picture of a screen and the page that holds it, beside writing as much text. The sound of a page's
// charts is left out: it is measured alone.
namespace bench {

// After the run.
void comparePages(std::vector<Row>& rows);

}  // namespace bench
