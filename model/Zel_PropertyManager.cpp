#include "Zel_PropertyManager.h"

Zel_PropertyManager::Zel_PropertyManager() = default;
Zel_PropertyManager::Zel_PropertyManager(const Zel_PropertyManager& other) = default;
Zel_PropertyManager& Zel_PropertyManager::operator=(const Zel_PropertyManager& other) = default;
Zel_PropertyManager::~Zel_PropertyManager() = default;
