#include <vexa/tables/colortableconfiguredialog.h>

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QVBoxLayout>

namespace vexa {

ColorTableConfigureDialog::ColorTableConfigureDialog(QWidget *parent)
    : QDialog(parent)
    , m_colorSpace(new QComboBox(this))
{
    setObjectName(QStringLiteral("colorTableConfigureDialog"));
    setWindowTitle(tr("Configure Color Table"));
    m_colorSpace->setObjectName(QStringLiteral("colorSpaceCombo"));
    m_colorSpace->addItem(tr("L*a*b"), int(EColorSpace::CIELab));
    m_colorSpace->addItem(tr("L*C*h"), int(EColorSpace::CIELCh));

    auto *form = new QFormLayout;
    form->addRow(tr("Color space"), m_colorSpace);
    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto *layout = new QVBoxLayout(this);
    layout->addLayout(form);
    layout->addWidget(buttons);
}

void ColorTableConfigureDialog::setColorSpace(EColorSpace colorSpace)
{
    m_colorSpace->setCurrentIndex(colorSpace == EColorSpace::CIELCh ? 1 : 0);
}

EColorSpace ColorTableConfigureDialog::colorSpace() const
{
    return EColorSpace(m_colorSpace->currentData().toInt());
}

} // namespace vexa
