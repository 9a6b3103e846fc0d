#include "library/tn_libraryunit.h"

Tn_LibraryUnit::~Tn_LibraryUnit() {}

Tn_LibraryUnitVisitor::~Tn_LibraryUnitVisitor() {}
