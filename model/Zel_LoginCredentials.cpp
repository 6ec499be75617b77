#include "Zel_LoginCredentials.h"

Zel_LoginCredentials::Zel_LoginCredentials() = default;
Zel_LoginCredentials::Zel_LoginCredentials(const Zel_LoginCredentials& other) = default;
Zel_LoginCredentials& Zel_LoginCredentials::operator=(const Zel_LoginCredentials& other) = default;
Zel_LoginCredentials::~Zel_LoginCredentials() = default;
