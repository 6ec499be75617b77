#include "Zel_NodeList.h"

Zel_NodeList::Zel_NodeList() = default;
Zel_NodeList::Zel_NodeList(const Zel_NodeList& other) = default;
Zel_NodeList& Zel_NodeList::operator=(const Zel_NodeList& other) = default;
Zel_NodeList::~Zel_NodeList() = default;
