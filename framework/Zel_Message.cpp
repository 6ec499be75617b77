#include "Zel_Message.h"

Zel_Message::Zel_Message(QString text)
    : mText(std::move(text))
{
}

Zel_Message::Zel_Message(const Zel_Message& other) = default;
Zel_Message& Zel_Message::operator=(const Zel_Message& other) = default;
Zel_Message::~Zel_Message() = default;

Zel_Message::operator QString() const
{
    return mText;
}
