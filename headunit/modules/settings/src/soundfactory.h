// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiSubmoduleFactory>

/// \brief Builds the sound page into whichever module asks for it.
class SoundFactory : public HmiCore::HmiSubmoduleFactory
{
    Q_OBJECT

public:
    explicit SoundFactory(QObject* parent);

    QString submoduleName() const override;
    QString viewDescriptorFile() const override;
    void create(const HmiCore::TargetState& target) override;
};
