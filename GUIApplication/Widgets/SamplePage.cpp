#include "Widgets/SamplePage.h"

SamplePage::SamplePage(QWidget* parent)
    : MarigoldPanel(parent)
{
}
