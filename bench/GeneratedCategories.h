#pragma once

namespace bench {

// 65 host classes with a category for each: five overrides, and a contract of six checks.
void registerGeneratedCategories();
// How many of them were installed.
int installGeneratedCategories();

}  // namespace bench
