#pragma once

#include <vexa/vexa_export.h>
#include <vexa/graph/linegraphview.h>

#include <QColor>
#include <QImage>
#include <QPixmap>
#include <QString>

#include <memory>

class QAction;
class QMenu;

namespace vexa {

class AppearanceValues;
class ReflectanceSpectrum;

// Reflectance spectra as curves: wavelength in nanometres across (fixed 400 to 700 nm),
// reflectance factor up (from 0, automatic maximum). The plot rectangle shows the colours
// of the spectrum behind the first series. The context menu (and Ctrl+C) copies the curves
// as tab-separated text: a wavelength column and one column per spectrum, named by its
// measurement and geometry.
class VEXA_EXPORT SpectralView : public LineGraphView
{
    Q_OBJECT
public:
    // The resource of the background image (rendered by tools/spectrum).
    static const char *const BackgroundImage;

    explicit SpectralView(QWidget *parent = nullptr);
    ~SpectralView() override;

    // One curve in the colour of `index` (see SpectralGraphData). A null spectrum adds nothing.
    void addSpectralData(std::shared_ptr<ReflectanceSpectrum> spectrum, int index);
    // One legend entry named by the measurement, in `color`, with one curve per reflectance
    // spectrum of the measurement in the colour of `index`. False (nothing added) for null values.
    bool didAddSpectralData(std::shared_ptr<AppearanceValues> values, int index, const QColor &color);

    QMenu *contextMenu() const { return m_contextMenu.get(); }
    QAction *copyAction() const { return m_copyAction; }
    // What the copy action puts on the clipboard.
    QString copyText() const;

    // The background image; a null image when the resource is missing.
    static QImage backgroundImage();

public Q_SLOTS:
    void copyToClipboard();

protected:
    void paintData(QPainter &painter, const std::shared_ptr<GraphData> &data, int index) override;
    std::string columnName(const GraphData &curve, const GraphData *group, int member, int members) const override;
    void contextMenuEvent(QContextMenuEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    void retranslate();
    const QPixmap &scaledBackground(const QSize &size);

    std::shared_ptr<QMenu> m_contextMenu; // Child of the view; deleted with it or by the last holder.
    QAction *m_copyAction;                // Child.
    QPixmap m_scaledBackground;
};

} // namespace vexa
