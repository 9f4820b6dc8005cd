#pragma once

#include <QStringList>

QT_BEGIN_NAMESPACE
class QQuickItem;
QT_END_NAMESPACE

/**
 * What is wrong with the texts of a scene under the pseudo-locale "en-XA", whose texts are all in brackets and longer
 * than any language's. One line for each fault, with the text and where it is; empty when all is well.
 *
 * Looked at is what is visible below an item, the item included. Give a window's content item to include menus.
 */

/** Texts that come from no table. Numbers and signs without letters are nobody's language, input is the user's own. */
QStringList untranslatedTexts(const QQuickItem &item);

/**
 * Texts that are elided, or painted beyond their item, beyond the button they are in, or beyond an item that clips or
 * that was given; what can be scrolled to counts as visible.
 */
QStringList clippedTexts(const QQuickItem &item);

/** Names, descriptions and values that assistive technologies read and that come from no table. */
QStringList untranslatedSpeech(const QQuickItem &item);
