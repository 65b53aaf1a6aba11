#ifndef SAMPLEPAGE_H
#define SAMPLEPAGE_H

#include "Screens/MarigoldPanel.h"

// A page of the sample view. Its edge arrows ask the container for the
// neighbouring page.
class SamplePage : public MarigoldPanel
{
    Q_OBJECT
public:
    explicit SamplePage(QWidget* parent = nullptr);

signals:
    void gotoRightPage();
    void gotoLeftPage();
};

#endif // SAMPLEPAGE_H
