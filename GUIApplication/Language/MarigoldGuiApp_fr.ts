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
        <source>Calibrating</source>
        <translation>Étalonnage en cours</translation>
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
        <translation>Étalonnez votre instrument avec l&apos;étalon blanc fourni avec celui-ci.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Numéro de série : %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Posez l&apos;instrument sur l&apos;étalon blanc en alignant la ligne blanche sur la référence voulue.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Vérifiez votre instrument avec la plaque de référence à effet fournie avec celui-ci. Numéro de série : %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Posez l&apos;instrument sur la plaque de référence à effet en alignant la ligne blanche sur la référence voulue</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Lancez l&apos;autotest de votre instrument avec l&apos;étalon blanc fourni avec celui-ci. Numéro de série : %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Posez l&apos;instrument sur l&apos;étalon blanc en alignant la ligne blanche sur la référence voulue</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Lancez l&apos;autotest de votre instrument avec la plaque de référence à effet fournie avec celui-ci. Numéro de série : %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Lancez l&apos;autotest en tenant l&apos;instrument en l&apos;air (posé sur rien)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Étalonnage</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Autotest %1 : %2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Contrôle de la plaque de référence</translation>
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
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>Effacer la base de données</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>Voulez-vous vraiment effacer la base de données ? Tous les échantillons et travaux de l&apos;instrument seront supprimés.</translation>
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
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>Supprimer l&apos;échantillon ?</translation>
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
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>Images caméra</translation>
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
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>Notes</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>Symboles</translation>
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
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>Récapitulatif</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Mesurer</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>Détails du travail</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nom :</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1 :</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>Notes :</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Envoyer le travail au serveur</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>Résultat SMC</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>Résultat moyen</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>Mesures</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%1 sur %2 terminées</translation>
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
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>Ce travail n&apos;a pas été créé sur l&apos;instrument. Voulez-vous vraiment le modifier ?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Modifier</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>Le nom du travail ne peut pas être vide</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>Saisissez un nom de travail unique et non vide</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>Ce nom de travail existe déjà</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>Ce nom de travail existe déjà. Veuillez choisir un nom unique</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>Cette étiquette n&apos;existe pas</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>Cette étiquette n&apos;existe pas. Veuillez choisir une étiquette existante</translation>
    </message>
</context>
<context>
    <name>Keypad</name>
    <message>
        <source>123</source>
        <translation>123</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
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
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>Confirmez en faisant le tour du cercle avec le point</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Rétablir les paramètres d&apos;usine</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>Tous les paramètres reviendront aux valeurs par défaut. Les travaux et les échantillons seront également perdus !</translation>
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
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>Vue couleur</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>Série 15%1</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>Série 45%1</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>Texture 15%1</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>D&apos;autres mesures sont nécessaires pour terminer ce travail</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>Mesure</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>Images caméra</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>Détails</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
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
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>Base de données / mémoire</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>Échantillons</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>Travaux</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>Effacer la base de données</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>Aucun fichier</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>Affichage</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>Luminosité de l&apos;écran</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>Impossible d&apos;afficher le fichier.</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>Impossible de lire le fichier.</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>Langue</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>Informations légales</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1 heure </translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1 heures </translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1 minutes et </translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1 secondes</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>Jamais</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>Atténuation après : %1
Veille après : %2
Arrêt après : %3</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionProgressItem</name>
    <message>
        <source>%1%</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%1 sur %2</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionSliderItem</name>
    <message>
        <source>Never</source>
        <translation>Jamais</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>Paramètres</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>Valide</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>Expirée</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>Non connecté</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>%1%</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Power</source>
        <translation>Alimentation</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Langue</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>Étalonnage</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Options de mesure</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>Affichage</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>Volume du bip</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>Économie d&apos;énergie</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>Système et diagnostic</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>Activé</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Désactivé</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Options de mesure</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>Mesure automatique</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>Délai avant la mesure automatique (s) :</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>Mode de mesure</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>Nombre de mesures valides requises :</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>Nombre maximal de mesures :</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>Mesures automatiques : %1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>Afficher LABCH : %1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>Ignorer les capteurs de pression : %1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>Économie
d&apos;énergie</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>Atténuer l&apos;écran</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>Mode veille</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Éteindre</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>Secondes avant atténuation :</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>Minutes avant la veille :</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>Minutes avant l&apos;arrêt :</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>Alimentation</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Éteindre</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Redémarrer</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>Éteindre l&apos;instrument ?</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>Voulez-vous vraiment éteindre l&apos;instrument ?</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>Passer en veille ?</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>Voulez-vous vraiment mettre l&apos;instrument en veille ?</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>Redémarrer l&apos;instrument ?</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>Voulez-vous vraiment redémarrer l&apos;instrument ?</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>Oui</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Non</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>Système et
diagnostic</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>Informations système</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>Base de données / mémoire</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>Informations légales</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autotest</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>Informations système</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>Non configuré</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>Modèle :</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>N° de série :</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>Référence :</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>Étalon blanc :</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>Date de certification :</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>Version du micrologiciel :</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>Version de l&apos;interface :</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>Noyau :</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>Chargeur d&apos;amorçage :</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>URL du serveur :</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Rétablir les paramètres d&apos;usine</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>Logiciels libres</translation>
    </message>
    <message>
        <source>Burn in BIRCH JuniperX/Juniper</source>
        <translation>Burn in BIRCH JuniperX/Juniper</translation>
    </message>
    <message>
        <source>Burn in ALDER Larch</source>
        <translation>Burn in ALDER Larch</translation>
    </message>
    <message>
        <source>Burn in Spruce / Sequoia</source>
        <translation>Burn in Spruce / Sequoia</translation>
    </message>
</context>
<context>
    <name>SettingsVolumePage</name>
    <message>
        <source>Beeper Volume</source>
        <translation>Volume du bip</translation>
    </message>
</context>
<context>
    <name>SettingsWifiPage</name>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Activé</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Désactivé</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>IP statique</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>Réseaux connus</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>Réseaux disponibles</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>Problème de connexion</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>Mot de passe incorrect</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>Réseau hors de portée</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
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
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>Travail</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>Appuyez sur Mesurer.</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>Visée</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>Moyennées 0 sur SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Mesurer</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>Terminer</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>Mode en ligne</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>Moyennées %1 sur SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>Quitter le mode en ligne ?</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>Quitter le mode en ligne arrête la visée et revient à la liste des travaux.</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Quitter</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>Arrêter la mesure ?</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>Tous les échantillons mesurés et ce travail seront définitivement supprimés.</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>Tous les échantillons mesurés de ce travail seront définitivement supprimés.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>Continuer</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>Température hors plage. Continuer en mode en ligne jusqu&apos;à la fin, ou quitter le mode en ligne et revenir à la liste des travaux ?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>Température hors plage. Continuer le travail jusqu&apos;à la fin, ou supprimer le travail et tous les échantillons et revenir à la liste ?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>Température hors plage. Continuer le travail jusqu&apos;à la fin, ou supprimer tous les échantillons et revenir à la liste ?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>Ignorer les capteurs de pression ?</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>Tous les capteurs de pression ne sont pas actifs. Appuyez à nouveau sur le bouton de mesure pour mesurer, ou sur Annuler pour revenir à la visée.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Information</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>Tous les capteurs de pression ne sont pas actifs. Assurez-vous qu&apos;ils le sont tous avant de mesurer</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>Continuer la mesure ?</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>Pour continuer les mesures, appuyez sur OK</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>Temps du travail écoulé</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>Le travail n&apos;a pas été terminé dans le temps imparti</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC terminé de force, toutes les mesures sont moyennées pour le résultat.</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>Nombre maximal de mesures SMC atteint pour ce travail</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Terminé</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>Le travail est terminé. Appuyez sur OK pour quitter le mode en ligne</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC terminé de force, toutes les mesures sont moyennées. Appuyez sur OK pour quitter le mode en ligne</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>SMC en échec après le maximum de %1 mesures, le résultat final est moyenné. Appuyez sur OK pour quitter le mode en ligne</translation>
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
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>Mot de passe</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>@&amp;*</source>
        <translation>@&amp;*</translation>
    </message>
</context>
</TS>
