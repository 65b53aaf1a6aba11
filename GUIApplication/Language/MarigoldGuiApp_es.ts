<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>Calibración necesaria</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>No se pueden realizar nuevas mediciones hasta que el instrumento esté calibrado. Pulse Calibrar para iniciar la calibración.</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>Ignorar</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrar</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>Calibración necesaria en %1 %2</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>segundos</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>minutos</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>horas</translation>
    </message>
    <message>
        <source>days</source>
        <translation>días</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>Iniciando calibración</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrando</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>No toque ni golpee el instrumento</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calculando</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completado</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Ya puede mover el instrumento</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>Iniciando medición</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>Midiendo</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>No todos los sensores de presión están activos. Pulse OK para iniciar la calibración cuando todos los sensores estén activos</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>Posición incorrecta</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>COLOCAR SOBRE SUPERFICIE PLANA</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>ALINEAR LA LÍNEA BLANCA</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>Toque el botón Calibrar para iniciar la calibración</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrar</translation>
    </message>
    <message>
        <source>or</source>
        <translation>o</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>Pulse el botón de medición del instrumento</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>Paso 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Paso %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>Toque el botón Autoprueba para iniciar la autoprueba</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autoprueba</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Calibre su instrumento con el patrón blanco incluido con el instrumento.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Número de serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Coloque el instrumento sobre el patrón blanco alineando la línea blanca con la referencia deseada.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Verifique su instrumento con la placa de referencia de efecto incluida con el instrumento. Número de serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Coloque el instrumento sobre la placa de referencia de efecto alineando la línea blanca con la referencia deseada</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Realice la autoprueba de su instrumento con el patrón blanco incluido. Número de serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Coloque el instrumento sobre el patrón blanco alineando la línea blanca con la referencia deseada</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Realice la autoprueba de su instrumento con la placa de referencia de efecto incluida. Número de serie: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Realice la autoprueba levantando el instrumento en el aire (sin apoyarlo en nada)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Calibración</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Autoprueba %1: %2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Verificación de placa de referencia</translation>
    </message>
</context>
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Falló la comprobación de referencia</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memoria del instrumento llena</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>No hay memoria suficiente para completar el trabajo. Elimine trabajos existentes para liberar memoria.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>No hay entradas en la base de datos</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Medición cancelada</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>El instrumento se movió durante la medición</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Índice no válido</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Error de calibración</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>El instrumento no está sobre la placa blanca o el blanco interno está sucio</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Datos de calibración no válidos</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>No calibrado</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Placa blanca externa demasiado sucia o incorrecta</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Medición interrumpida</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>El usuario ha interrumpido la medición</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Batería baja. Cargue la batería</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Batería agotada. El instrumento se apagará</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Error en el motor del obturador</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>No hay ninguna medición de referencia guardada</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Tiempo de integración espectral sobre blanco demasiado largo</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Desplazamiento de longitud de onda superior al límite de 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Poco espacio libre</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Problema al cambiar el modo Wi-Fi</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Problema al buscar redes Wi-Fi</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Temperatura de la muestra demasiado alta (sensor IR)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Temperatura de la muestra demasiado baja (sensor IR)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Nivel de batería demasiado bajo para actualizar</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Fecha y hora sin configurar</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problema durante la inicialización. Reinicie el dispositivo</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Error de comunicación del hardware. Reinicie el dispositivo</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Error durante la medición</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Diferentes mejores coincidencias para los puntos de control</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrando</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>Borrar base de datos</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>¿Seguro que desea borrar la base de datos? Se eliminarán todas las muestras y todos los trabajos del instrumento.</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>¿Eliminar todas las muestras?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>¿Eliminar muestra?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>Imágenes de cámara</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>Eliminar trabajo</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>Ver/editar trabajo</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>Copiar trabajo</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Enviar trabajo al servidor</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>Ejecutar trabajo</translation>
    </message>
</context>
<context>
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>Notas</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>Símbolos</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>Eliminar todos los trabajos completados</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>Trabajos</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Abiertos</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completados</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>Abiertos (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>Completados (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>¿Eliminar trabajo?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>El trabajo completo y todas sus muestras se eliminarán de forma permanente.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>¿Eliminar todos los trabajos completados?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>Todos los trabajos completados se eliminarán de forma permanente.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memoria del instrumento llena</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>No se puede crear un trabajo nuevo hasta que se eliminen uno o más trabajos del instrumento.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>No hay memoria suficiente para completar el trabajo. Elimine trabajos existentes para liberar memoria.</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>Resumen</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Medir</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>Detalles del trabajo</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nombre:</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1:</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>Notas:</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Enviar trabajo al servidor</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>Resultado SMC</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>Resultado promedio</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>Mediciones</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%1/%2 completadas</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>¿Eliminar trabajo?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>El trabajo completo y todas sus muestras se eliminarán de forma permanente.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>Este trabajo no se creó en el instrumento. ¿Seguro que desea editarlo?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>Nombre</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>El nombre del trabajo no puede estar vacío</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>Introduzca un nombre de trabajo único y no vacío</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>El nombre del trabajo ya existe</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>Este nombre de trabajo ya existe. Cámbielo por un nombre único</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>La etiqueta no existe</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>Esta etiqueta no existe. Elija una etiqueta existente</translation>
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
        <translation>Instrumento bloqueado</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>Midiendo</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>Mantenga firme</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>No toque ni golpee el instrumento</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calculando</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Ya puede mover el instrumento</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Apagar</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Reiniciar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>Confirme girando el punto alrededor del círculo</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Restaurar ajustes de fábrica</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>Todos los ajustes volverán a sus valores predeterminados. ¡También se perderán los trabajos y las muestras!</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Se ha producido un error. Reinicie el instrumento</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>Vista de color</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>Serie 15%1</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>Serie 45%1</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>Textura 15%1</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>Se necesitan más mediciones para completar este trabajo</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>Medición</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>Imágenes de cámara</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>Detalles</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>Correcto</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>Fallo</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>Cancelado</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>Mantenga el instrumento en el aire</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>No toque ni golpee el instrumento</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completado</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>Autoprueba</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>Calibración de blanco</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>Verificación de referencia en blanco</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>Prueba de placa de efecto</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>Pruebas de repetibilidad</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>Pruebas de temperatura</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>Prueba de sensores de presión</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>Comprobar registros de errores</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>Probando...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>Todas las pruebas completadas</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>Autopruebas canceladas</translation>
    </message>
</context>
<context>
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>Base de datos / memoria</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>Muestras</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>Trabajos</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>Borrar base de datos</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>Sin archivos</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>Pantalla</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>Brillo de pantalla</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>No se puede mostrar el archivo.</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>No se puede leer el archivo.</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>Idioma</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>Información legal</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1 hora </translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1 horas </translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1 minutos y </translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1 segundos</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>Nunca</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>Atenuación tras: %1
Reposo tras: %2
Apagado tras: %3</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionProgressItem</name>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%1 de %2</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionSliderItem</name>
    <message>
        <source>Never</source>
        <translation>Nunca</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>Ajustes</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>Válida</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>Caducada</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>No conectado</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Power</source>
        <translation>Encendido</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Idioma</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>Calibración</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Opciones de medición</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>Pantalla</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>Volumen del pitido</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>Ahorro de energía</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>Sistema y diagnóstico</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>Activado</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Desactivado</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Opciones de medición</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>Medición automática</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>Tiempo hasta la medición automática (s):</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>Modo de medición</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>N.º de mediciones válidas necesarias:</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>Mediciones máximas:</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>Mediciones automáticas: %1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>Mostrar LABCH: %1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>Ignorar sensores de presión: %1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>Ahorro de
energía</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>Atenuar pantalla</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>Modo de reposo</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Apagar</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>Segundos hasta atenuar la pantalla:</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>Minutos hasta el reposo:</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>Minutos hasta apagarse:</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>Encendido</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Apagar</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Reiniciar</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>¿Apagar el instrumento?</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>¿Seguro que desea apagar el instrumento?</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>¿Pasar a reposo?</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>¿Seguro que desea poner el instrumento en reposo?</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>¿Reiniciar el instrumento?</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>¿Seguro que desea reiniciar el instrumento?</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>Sí</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>Sistema y
diagnóstico</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>Información del sistema</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>Base de datos / memoria</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>Información legal</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autoprueba</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>Información del sistema</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>No configurado</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>Modelo:</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>N.º de serie:</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>Referencia:</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>Patrón blanco:</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>Fecha de certificación:</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>Versión de firmware:</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>Versión de la interfaz:</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>Kernel:</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>Bootloader:</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>URL del servidor:</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Restaurar ajustes de fábrica</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>Código abierto</translation>
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
        <translation>Volumen del pitido</translation>
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
        <translation>Activado</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Desactivado</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>IP estática</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>Redes conocidas</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>Redes disponibles</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>Problema de conexión</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>Contraseña incorrecta</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>Red fuera de alcance</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>Inglés</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>Español</translation>
    </message>
    <message>
        <source>French</source>
        <translation>Francés</translation>
    </message>
    <message>
        <source>German</source>
        <translation>Alemán</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>Italiano</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>Portugués</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>Japonés</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>Coreano</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>Chino simplificado</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Personalizado</translation>
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
        <translation>Difusa</translation>
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
        <translation>Gama media</translation>
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
        <translation>Sin promedio</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>Promedio 3</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>Promedio 5</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>Patrón blanco</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>Patrón de referencia</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>Levantado</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>Patrón blanco completado</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>Patrón de referencia completado</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>Levantado completado</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>Sincronizando datos del trabajo</translation>
    </message>
</context>
<context>
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>Trabajo</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>Pulse el botón para medir.</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>Posicionamiento</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>Promediadas 0 de SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Medir</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>Finalizar</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>Modo en línea</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>Promediadas %1 de SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>¿Salir del modo en línea?</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>Al salir del modo en línea se detiene el posicionamiento y se vuelve a la lista de trabajos.</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Salir</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>¿Dejar de medir?</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>Todas las muestras medidas y este trabajo se eliminarán de forma permanente.</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>Todas las muestras medidas de este trabajo se eliminarán de forma permanente.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>Continuar</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>Temperatura fuera de rango. ¿Continuar en modo en línea hasta terminar, o salir del modo en línea y volver a la lista de trabajos?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>Temperatura fuera de rango. ¿Continuar el trabajo hasta terminar, o eliminar el trabajo y todas las muestras y volver a la lista?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>Temperatura fuera de rango. ¿Continuar el trabajo hasta terminar, o eliminar todas las muestras y volver a la lista?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>¿Ignorar los sensores de presión?</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>No todos los sensores de presión están activos. Pulse de nuevo el botón de medición para medir, o Cancelar para volver al posicionamiento.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Información</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>No todos los sensores de presión están activos. Asegúrese de que todos estén activos antes de medir</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>¿Seguir midiendo?</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>Para seguir midiendo, pulse Aceptar</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>Tiempo del trabajo agotado</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>El trabajo no se completó en el tiempo asignado</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC finalizado a la fuerza; todas las lecturas se promedian para el resultado.</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>Se ha usado el número máximo de mediciones SMC de este trabajo</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completado</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>El trabajo se ha completado. Pulse Aceptar para salir del modo en línea</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC finalizado a la fuerza; todas las lecturas se promedian. Pulse Aceptar para salir del modo en línea</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>SMC fallido tras el máximo de %1 mediciones; el resultado final es el promedio. Pulse Aceptar para salir del modo en línea</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Guardar promedio</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Reiniciar trabajo</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Deshacer</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>Enviar todos los trabajos al servidor</translation>
    </message>
</context>
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>Contraseña</translation>
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
