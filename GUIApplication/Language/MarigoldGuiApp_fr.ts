<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>Étalonnage requis</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>Aucune nouvelle mesure n&apos;est possible avant l&apos;étalonnage de l&apos;instrument. Appuyez sur Étalonner pour lancer l&apos;étalonnage.</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>Ignorer</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Étalonner</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>Étalonnage requis dans %1 %2</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>secondes</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>minutes</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>heures</translation>
    </message>
    <message>
        <source>days</source>
        <translation>jours</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>Début de l&apos;étalonnage</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Ne touchez pas et ne heurtez pas l&apos;instrument</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Étalonnage en cours</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calcul en cours</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Terminé</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Vous pouvez déplacer l&apos;instrument</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>Début de la mesure</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>Mesure en cours</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>Tous les capteurs de pression ne sont pas actifs. Appuyez sur OK pour lancer l&apos;étalonnage lorsque tous les capteurs sont actifs</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>Position incorrecte</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>POSER SUR UNE SURFACE PLANE</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>ALIGNER LA LIGNE BLANCHE</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>Touchez le bouton Étalonner pour lancer l&apos;étalonnage</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Étalonner</translation>
    </message>
    <message>
        <source>or</source>
        <translation>ou</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>Appuyez sur le bouton de mesure de l&apos;instrument</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>Étape 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Étape %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>Touchez le bouton Autotest pour lancer l&apos;autotest</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autotest</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Étalonnez votre instrument avec la plaque de référence blanche fournie.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Numéro de série : %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Posez l&apos;instrument sur la plaque d&apos;étalonnage blanche en alignant la ligne blanche sur le repère.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Vérifiez votre instrument avec la plaque de référence à effet fournie. Numéro de série : %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Posez l&apos;instrument sur la plaque de référence à effet en alignant la ligne blanche sur le repère</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Effectuez l&apos;autotest avec la plaque de référence blanche fournie. Numéro de série : %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Posez l&apos;instrument sur la plaque de référence blanche en alignant la ligne blanche sur le repère</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Effectuez l&apos;autotest avec la plaque de référence à effet fournie. Numéro de série : %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Effectuez l&apos;autotest en tenant l&apos;instrument en l&apos;air (posé sur rien)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Étalonnage</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Contrôle de la plaque de référence</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Autotest %1 : %2</translation>
    </message>
</context>
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Échec du contrôle de référence</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Mémoire pleine</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>La mémoire est insuffisante pour ce travail. Supprimez des travaux existants pour libérer de la mémoire.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>Aucune entrée dans la base de données</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Mesure annulée</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>L&apos;instrument a été déplacé pendant la mesure</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Index non valide</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Erreur d&apos;étalonnage</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>Instrument pas sur la céramique blanche, ou blanc interne sale</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Données d&apos;étalonnage non valides</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Non étalonné</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Céramique blanche externe trop sale ou incorrecte</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Mesure interrompue</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>La mesure a été interrompue par l&apos;utilisateur</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Batterie faible. Rechargez la batterie</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Batterie vide. L&apos;instrument va s&apos;éteindre</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Erreur du moteur d&apos;obturateur</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>Aucune mesure de référence enregistrée</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Temps d&apos;intégration spectrale sur le blanc trop long</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Décalage de longueur d&apos;onde au-delà de la limite de 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Mémoire presque pleine</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Problème lors du changement de mode Wi-Fi</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Problème lors de la recherche de réseaux Wi-Fi</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Température de l&apos;échantillon trop élevée (capteur IR)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Température de l&apos;échantillon trop basse (capteur IR)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Niveau de batterie trop faible pour la mise à jour</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Date et heure non réglées</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problème lors de l&apos;initialisation. Redémarrez l&apos;appareil</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Erreur de communication matérielle. Redémarrez l&apos;appareil</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Erreur pendant la mesure</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Meilleures correspondances différentes pour les points de contrôle</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Étalonnage en cours</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>Supprimer tous les échantillons ?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Non</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>Supprimer le travail</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>Voir/modifier le travail</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>Copier le travail</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Envoyer le travail au serveur</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>Exécuter le travail</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>Supprimer tous les travaux terminés</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>Travaux</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Ouverts</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Terminés</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>Ouverts (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>Terminés (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Supprimer le travail ?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>Le travail entier et tous ses échantillons seront définitivement supprimés.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>Supprimer tous les travaux terminés ?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>Tous les travaux terminés seront définitivement supprimés.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Mémoire pleine</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>Impossible de créer un travail tant qu&apos;un ou plusieurs travaux n&apos;ont pas été supprimés de l&apos;instrument.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>La mémoire est insuffisante pour ce travail. Supprimez des travaux existants pour libérer de la mémoire.</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Instrument verrouillé</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>Mesure en cours</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>Ne bougez pas</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Ne touchez pas et ne heurtez pas l&apos;instrument</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calcul en cours</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Vous pouvez déplacer l&apos;instrument</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Éteindre</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Redémarrer</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Une erreur s&apos;est produite. Redémarrez l&apos;instrument</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>Réussi</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>Échec</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>Annulé</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>Tenez l&apos;instrument en l&apos;air</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Ne touchez pas et ne heurtez pas l&apos;instrument</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Terminé</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>Autotest</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>Étalonnage du blanc</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>Contrôle de référence sur blanc</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>Test de la plaque à effet</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>Tests de répétabilité</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>Tests de température</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>Test des capteurs de pression</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>Vérifier les journaux d&apos;erreurs</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>Test en cours...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>Tous les tests sont terminés</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>Autotests annulés</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>Anglais</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>Espagnol</translation>
    </message>
    <message>
        <source>French</source>
        <translation>Français</translation>
    </message>
    <message>
        <source>German</source>
        <translation>Allemand</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>Italien</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>Portugais</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>Japonais</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>Coréen</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>Chinois simplifié</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Personnalisé</translation>
    </message>
    <message>
        <source>-45%1</source>
        <translation>-45%1</translation>
    </message>
    <message>
        <source>-15%1</source>
        <translation>-15%1</translation>
    </message>
    <message>
        <source>15%1</source>
        <translation>15%1</translation>
    </message>
    <message>
        <source>45%1</source>
        <translation>45%1</translation>
    </message>
    <message>
        <source>80%1</source>
        <translation>80%1</translation>
    </message>
    <message>
        <source>Diffuse</source>
        <translation>Diffuse</translation>
    </message>
    <message>
        <source>25%1</source>
        <translation>25%1</translation>
    </message>
    <message>
        <source>75%1</source>
        <translation>75%1</translation>
    </message>
    <message>
        <source>110%1</source>
        <translation>110%1</translation>
    </message>
    <message>
        <source>A/2%1</source>
        <translation>A/2%1</translation>
    </message>
    <message>
        <source>A/10%1</source>
        <translation>A/10%1</translation>
    </message>
    <message>
        <source>C/2%1</source>
        <translation>C/2%1</translation>
    </message>
    <message>
        <source>C/10%1</source>
        <translation>C/10%1</translation>
    </message>
    <message>
        <source>D50/2%1</source>
        <translation>D50/2%1</translation>
    </message>
    <message>
        <source>D50/10%1</source>
        <translation>D50/10%1</translation>
    </message>
    <message>
        <source>D55/2%1</source>
        <translation>D55/2%1</translation>
    </message>
    <message>
        <source>D55/10%1</source>
        <translation>D55/10%1</translation>
    </message>
    <message>
        <source>D65/2%1</source>
        <translation>D65/2%1</translation>
    </message>
    <message>
        <source>D65/10%1</source>
        <translation>D65/10%1</translation>
    </message>
    <message>
        <source>D75/2%1</source>
        <translation>D75/2%1</translation>
    </message>
    <message>
        <source>D75/10%1</source>
        <translation>D75/10%1</translation>
    </message>
    <message>
        <source>F2/2%1</source>
        <translation>F2/2%1</translation>
    </message>
    <message>
        <source>F2/10%1</source>
        <translation>F2/10%1</translation>
    </message>
    <message>
        <source>F7/2%1</source>
        <translation>F7/2%1</translation>
    </message>
    <message>
        <source>F7/10%1</source>
        <translation>F7/10%1</translation>
    </message>
    <message>
        <source>F8/2%1</source>
        <translation>F8/2%1</translation>
    </message>
    <message>
        <source>F8/10%1</source>
        <translation>F8/10%1</translation>
    </message>
    <message>
        <source>F10/2%1</source>
        <translation>F10/2%1</translation>
    </message>
    <message>
        <source>F10/10%1</source>
        <translation>F10/10%1</translation>
    </message>
    <message>
        <source>F11/2%1</source>
        <translation>F11/2%1</translation>
    </message>
    <message>
        <source>F11/10%1</source>
        <translation>F11/10%1</translation>
    </message>
    <message>
        <source>F12/2%1</source>
        <translation>F12/2%1</translation>
    </message>
    <message>
        <source>F12/10%1</source>
        <translation>F12/10%1</translation>
    </message>
    <message>
        <source>Mid Tier</source>
        <translation>Milieu de gamme</translation>
    </message>
    <message>
        <source>ALDER</source>
        <translation>ALDER</translation>
    </message>
    <message>
        <source>BIRCH</source>
        <translation>BIRCH</translation>
    </message>
    <message>
        <source>QC</source>
        <translation>QC</translation>
    </message>
    <message>
        <source>No Averaging</source>
        <translation>Sans moyenne</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>Moyenne 3</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>Moyenne 5</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>Céramique blanche</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>Céramique de référence</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>Soulevé</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>Céramique blanche terminée</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>Céramique de référence terminée</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>Soulevé terminé</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>Synchronisation des données du travail</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Enregistrer la moyenne</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Recommencer le travail</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Annuler l&apos;action</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Retour</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>Envoyer tous les travaux au serveur</translation>
    </message>
</context>
</TS>
