#include "Zel_DirectoryList.h"

Zel_DirectoryList::Zel_DirectoryList() = default;
Zel_DirectoryList::Zel_DirectoryList(const Zel_DirectoryList& other) = default;
Zel_DirectoryList& Zel_DirectoryList::operator=(const Zel_DirectoryList& other) = default;
Zel_DirectoryList::~Zel_DirectoryList() = default;
