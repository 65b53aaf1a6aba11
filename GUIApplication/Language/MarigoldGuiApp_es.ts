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
        <source>Do not touch or bump instrument</source>
        <translation>No toque ni golpee el instrumento</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrando</translation>
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
        <translation>Toque el botón Autoprueba para iniciarla</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autoprueba</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Calibre el instrumento con la placa de referencia blanca incluida.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Número de serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Coloque el instrumento sobre la placa de calibración blanca alineando la línea blanca con la referencia.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Verifique el instrumento con la placa de referencia de efecto incluida. Número de serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Coloque el instrumento sobre la placa de referencia de efecto alineando la línea blanca con la referencia</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Realice la autoprueba con la placa de referencia blanca incluida. Número de serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Coloque el instrumento sobre la placa de referencia blanca alineando la línea blanca con la referencia</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Realice la autoprueba con la placa de referencia de efecto incluida. Número de serie: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Realice la autoprueba con el instrumento levantado en el aire (sin apoyarlo en nada)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Calibración</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Verificación de placa de referencia</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Autoprueba %1: %2</translation>
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
</TS>
