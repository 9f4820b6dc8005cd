#include "shell/tabsegments.h"

#include "theme/theme.h"

#include <algorithm>

namespace favrin::shell {

using service::ColorPickerState;
using service::Tab;

TabSegments::TabSegments(QObject *parent) : QObject(parent)
{
    connect(&theme::Theme::instance(), &theme::Theme::localeChanged, this, &TabSegments::titlesChanged);
}

void TabSegments::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state)
        connect(state, &ColorPickerState::selectedTabChanged, this, &TabSegments::currentChanged);
    Q_EMIT colorPickerStateChanged();
    Q_EMIT currentChanged();
}

QStringList TabSegments::titles() const
{
    QStringList titles;
    for (const Tab tab : service::allTabs)
        titles.append(QString::fromStdString(service::localizedTitle(tab)));
    return titles;
}

int TabSegments::current() const
{
    if (!m_state)
        return 0;
    const auto found = std::ranges::find(service::allTabs, m_state->selectedTab());
    return found == service::allTabs.end() ? 0 : static_cast<int>(found - service::allTabs.begin());
}

void TabSegments::setCurrent(int position)
{
    if (!m_state || position < 0 || position >= static_cast<int>(service::allTabs.size()))
        return;
    const Tab tab = service::allTabs[static_cast<std::size_t>(position)];
    if (tab != m_state->selectedTab())
        m_state->selectedTab.set(tab);
}

} // namespace favrin::shell
