#pragma once

#include <vexa/vexa_export.h>
#include <vexa/models/colorspace.h>

#include <QDialog>

class QComboBox;

namespace vexa {

// Chooses how the colour table shows the trials' coordinates: "L*a*b" or "L*C*h".
class VEXA_EXPORT ColorTableConfigureDialog : public QDialog
{
    Q_OBJECT
public:
    explicit ColorTableConfigureDialog(QWidget *parent = nullptr);

    // Preselects the choice of a colour space (L*a*b for anything but CIELCh).
    void setColorSpace(EColorSpace colorSpace);
    // CIELab or CIELCh.
    EColorSpace colorSpace() const;
    QComboBox *colorSpaceComboBox() const { return m_colorSpace; }

private:
    QComboBox *m_colorSpace;
};

} // namespace vexa
