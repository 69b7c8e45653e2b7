#pragma once

#include <QCoreApplication>
#include <QString>
#include <QTranslator>

/// Gives every text back in brackets while it lives, so that a test sees which texts are translated.
class BracketTranslator : public QTranslator
{
public:
    BracketTranslator() { QCoreApplication::installTranslator(this); }
    ~BracketTranslator() override { QCoreApplication::removeTranslator(this); }

    QString translate(const char * /*context*/, const char *text, const char * /*note*/, int /*number*/) const override
    {
        return u'[' + QString::fromUtf8(text) + u']';
    }
    bool isEmpty() const override { return false; }
};
