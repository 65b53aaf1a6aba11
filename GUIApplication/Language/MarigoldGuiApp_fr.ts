<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
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
        <translation>L'instrument a été déplacé pendant la mesure</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Index non valide</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Erreur d'étalonnage</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>Instrument pas sur la céramique blanche, ou blanc interne sale</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Données d'étalonnage non valides</translation>
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
        <translation>La mesure a été interrompue par l'utilisateur</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Batterie faible. Rechargez la batterie</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Batterie vide. L'instrument va s'éteindre</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Erreur du moteur d'obturateur</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>Aucune mesure de référence enregistrée</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Temps d'intégration spectrale sur le blanc trop long</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Décalage de longueur d'onde au-delà de la limite de 5 nm</translation>
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
        <translation>Température de l'échantillon trop élevée (capteur IR)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Température de l'échantillon trop basse (capteur IR)</translation>
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
        <translation>Problème lors de l'initialisation. Redémarrez l'appareil</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Erreur de communication matérielle. Redémarrez l'appareil</translation>
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
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>Supprimer l'échantillon ?</translation>
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
        <translation>Impossible de créer un travail tant qu'un ou plusieurs travaux n'ont pas été supprimés de l'instrument.</translation>
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
        <translation>Ce travail n'a pas été créé sur l'instrument. Voulez-vous vraiment le modifier ?</translation>
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
        <translation>Ne touchez pas et ne heurtez pas l'instrument</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calcul en cours</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Vous pouvez déplacer l'instrument</translation>
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
        <translation>Une erreur s'est produite. Redémarrez l'instrument</translation>
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
        <translation>D'autres mesures sont nécessaires pour terminer ce travail</translation>
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
        <translation>Annuler l'action</translation>
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
