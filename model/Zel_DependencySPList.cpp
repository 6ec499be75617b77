#include "Zel_DependencySPList.h"

Zel_DependencySPList::Zel_DependencySPList() = default;
Zel_DependencySPList::Zel_DependencySPList(const Zel_DependencySPList& other) = default;
Zel_DependencySPList& Zel_DependencySPList::operator=(const Zel_DependencySPList& other) = default;
Zel_DependencySPList::~Zel_DependencySPList() = default;
