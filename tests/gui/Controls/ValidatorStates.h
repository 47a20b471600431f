#pragma once

#include <QStringList>
#include <QValidator>

#include <gtest/gtest.h>

namespace orvela {

/// Each of the texts is judged so.
inline void expectState(const QValidator& validator, QValidator::State state, const QStringList& texts) {
    int position = 0;
    for (QString text : texts)
        EXPECT_EQ(validator.validate(text, position), state) << qPrintable(text);
}

} // namespace orvela
